sennet_add_fuzz_target(cim-text SOURCES "${PROJECT_SOURCE_DIR}/tests/fuzz/cim-text.cc" LIBS cimmodel)
