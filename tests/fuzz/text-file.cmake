sennet_add_fuzz_target(text-file SOURCES "${CMAKE_CURRENT_LIST_DIR}/text-file.cc" LIBS velmclient)
target_include_directories(fuzz-text-file PRIVATE "${PROJECT_SOURCE_DIR}/src")
