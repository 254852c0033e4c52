# The BIFF8 reader on raw Workbook streams, and the compound file reader on whole files.
penmoor_add_fuzzer(xls_reader SOURCES ${CMAKE_CURRENT_LIST_DIR}/xls_reader_fuzzer.cpp LIBS penmoor_xls)
penmoor_add_fuzzer(compoundfile SOURCES ${CMAKE_CURRENT_LIST_DIR}/compoundfile_fuzzer.cpp LIBS penmoor_xls)
