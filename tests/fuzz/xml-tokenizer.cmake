sennet_add_fuzz_target(xml-tokenizer SOURCES "${CMAKE_CURRENT_LIST_DIR}/xml-tokenizer.cc"
                       LIBS cimxml)
