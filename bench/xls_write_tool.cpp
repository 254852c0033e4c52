// Builds the benchmark content and saves it as an .xls file, as one process, so that it can be
// timed side by side with the peer writers: xls_write_tool ROWS COLUMNS OUT.xls
#include "bench/xls_content.h"
#include "spreadsheet/xls/xlsfile.h"

#include <cstdio>
#include <cstdlib>
#include <exception>

int main(int argc, char** argv)
{
    if (argc != 4) {
        std::fprintf(stderr, "usage: %s ROWS COLUMNS OUT.xls\n", argv[0]);
        return 2;
    }
    try {
        const penmoor::bench::XlsContent content { std::atoi(argv[1]), std::atoi(argv[2]) };
        penmoor::xls::saveXlsFile(penmoor::bench::buildWorkbook(content), argv[3]);
    } catch (const std::exception& error) {
        std::fprintf(stderr, "%s\n", error.what());
        return 1;
    }
    return 0;
}
