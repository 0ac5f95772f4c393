sennet_add_fuzz_target(mof SOURCES "${CMAKE_CURRENT_LIST_DIR}/mof.cc" LIBS cimomdcore)
