find_package(CURL REQUIRED)
sennet_add_fuzz_target(http-exchange SOURCES "${CMAKE_CURRENT_LIST_DIR}/http-exchange.cc"
                       LIBS cimclient cimxml cimmodel CURL::libcurl)
