sennet_add_fuzz_target(cimxml-request SOURCES "${CMAKE_CURRENT_LIST_DIR}/cimxml-request.cc"
                       LIBS cimxml)
