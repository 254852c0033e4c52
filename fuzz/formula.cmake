# The R1C1 formula parser, printer and evaluator on arbitrary text.
penmoor_add_fuzzer(formula SOURCES ${CMAKE_CURRENT_LIST_DIR}/formula.cpp LIBS penmoor_workbook)
