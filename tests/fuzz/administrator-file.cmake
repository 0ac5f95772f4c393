if(TARGET sennetctlcore)
    sennet_add_fuzz_target(administrator-file
        SOURCES "${CMAKE_CURRENT_LIST_DIR}/administrator-file.cc" LIBS sennetctlcore)
endif()
