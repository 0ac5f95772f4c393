sennet_add_fuzz_target(cimxml-response SOURCES "${CMAKE_CURRENT_LIST_DIR}/cimxml-response.cc"
                       LIBS cimxml)
