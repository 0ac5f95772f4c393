sennet_add_fuzz_target(mif-reader SOURCES "${CMAKE_CURRENT_LIST_DIR}/mif-reader.cc" LIBS mif_reader)
