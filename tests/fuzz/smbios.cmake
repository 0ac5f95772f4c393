sennet_add_fuzz_target(smbios SOURCES "${CMAKE_CURRENT_LIST_DIR}/smbios.cc" LIBS cimomdcore)
