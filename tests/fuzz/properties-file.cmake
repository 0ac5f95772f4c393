sennet_add_fuzz_target(properties-file SOURCES "${CMAKE_CURRENT_LIST_DIR}/properties-file.cc"
                       LIBS velmclient)
target_include_directories(fuzz-properties-file PRIVATE "${PROJECT_SOURCE_DIR}/src")
