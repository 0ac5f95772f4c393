sennet_add_fuzz_target(cimomd-request SOURCES "${CMAKE_CURRENT_LIST_DIR}/cimomd-request.cc"
                       LIBS cimomdcore)
