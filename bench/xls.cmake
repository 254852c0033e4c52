# .xls writing and reading: Google Benchmark timings, and a writer process that
# bench/xls_peers.sh times beside the peers (libxlsxwriter here, python3-xlwt as a script).
find_package(benchmark REQUIRED)
find_package(PkgConfig REQUIRED)
pkg_check_modules(XLSXWRITER REQUIRED IMPORTED_TARGET xlsxwriter)

add_library(penmoor_bench_xls_content STATIC ${CMAKE_CURRENT_LIST_DIR}/xls_content.cpp)
penmoor_target_defaults(penmoor_bench_xls_content)
target_link_libraries(penmoor_bench_xls_content PUBLIC penmoor_workbook)

add_executable(xls_bench ${CMAKE_CURRENT_LIST_DIR}/xls_bench.cpp)
penmoor_target_defaults(xls_bench)
target_link_libraries(xls_bench PRIVATE penmoor_bench_xls_content penmoor_xls benchmark::benchmark)

add_executable(xls_write_tool ${CMAKE_CURRENT_LIST_DIR}/xls_write_tool.cpp)
penmoor_target_defaults(xls_write_tool)
target_link_libraries(xls_write_tool PRIVATE penmoor_bench_xls_content penmoor_xls)

add_executable(xlsxwriter_peer ${CMAKE_CURRENT_LIST_DIR}/peers/xlsxwriter_peer.cpp)
penmoor_target_defaults(xlsxwriter_peer)
target_link_libraries(xlsxwriter_peer PRIVATE PkgConfig::XLSXWRITER)
foreach(target penmoor_bench_xls_content xls_bench xls_write_tool xlsxwriter_peer)
    set_target_properties(${target} PROPERTIES AUTOMOC OFF)
endforeach()
