sennet_add_fuzz_target(edid SOURCES "${CMAKE_CURRENT_LIST_DIR}/edid.cc" LIBS cimomdcore)
