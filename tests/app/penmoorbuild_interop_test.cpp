#include "model/defaultlist.h"
#include "tests/app/penmoorbuild.h"
#include "tests/support/temporaryfolder.h"
#include "tests/xls/support/files.h"

#include <cmath>
#include <map>
#include <sstream>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

namespace fs = std::filesystem;
using testing::runPenmoorBuild;
using testing::TemporaryFolder;
namespace reader = xls::test;

struct CellValue {
    std::string type;
    std::string value; // text as text, numbers as written by the reader
};
using SheetValues = std::map<std::pair<int, int>, CellValue>;

std::string unhexed(const std::string& hex)
{
    std::string text;
    if (hex == "-") {
        return text;
    }
    for (std::size_t i = 0; i + 1 < hex.size(); i += 2) {
        text += static_cast<char>(std::stoi(hex.substr(i, 2), nullptr, 16));
    }
    return text;
}

// What xlrd reads: the first sheet's name and its cells with their cached values.
struct XlrdView {
    std::string sheetName;
    int sheetCount = 0;
    SheetValues cells;
};

XlrdView readWithXlrd(const fs::path& file)
{
    XlrdView view;
    for (const std::string& line : reader::lines(reader::runPythonScript("xlrd_dump.py", { file.string() }))) {
        std::istringstream in(line);
        std::string kind;
        in >> kind;
        if (kind == "sheet") {
            int index = 0;
            std::string name;
            in >> index >> name;
            ++view.sheetCount;
            if (index == 0) {
                view.sheetName = unhexed(name);
            }
        } else if (kind == "cell") {
            int sheet = 0;
            int row = 0;
            int column = 0;
            CellValue cell;
            in >> sheet >> row >> column >> cell.type >> cell.value;
            if (sheet == 0 && cell.type != "blank") {
                cell.value = cell.type == "text" ? unhexed(cell.value) : cell.value;
                view.cells[{ row, column }] = cell;
            }
        }
    }
    return view;
}

// What LibreOffice computes for the first sheet after loading, which recalculates formulas.
SheetValues readWithLibreOffice(const fs::path& file, const fs::path& folder)
{
    SheetValues values;
    const fs::path converted = reader::convertWithLibreOffice(file, "fods", folder);
    if (converted.empty()) {
        return values;
    }
    for (const std::string& line : reader::lines(reader::runPythonScript("lo_fods_dump.py", { converted.string() }))) {
        std::istringstream in(line);
        std::string kind;
        int sheet = 0;
        int row = 0;
        int column = 0;
        CellValue cell;
        in >> kind >> sheet >> row >> column >> cell.type;
        std::getline(in >> std::ws, cell.value);
        if (kind == "value" && sheet == 0) {
            values[{ row, column }] = cell;
        }
    }
    return values;
}

std::string text(const SheetValues& cells, int row, int column)
{
    const auto found = cells.find({ row, column });
    return found == cells.end() || found->second.type != "text" ? "(no text)" : found->second.value;
}

double number(const SheetValues& cells, int row, int column)
{
    const auto found = cells.find({ row, column });
    return found == cells.end() || found->second.type != "number" ? std::nan("") : std::stod(found->second.value);
}

// The labels of column B from row 5 down, in order.
std::vector<std::string> labels(const SheetValues& cells)
{
    std::vector<std::string> found;
    for (const auto& [position, cell] : cells) {
        if (position.second == 1 && position.first >= 4 && cell.type == "text") {
            found.push_back(cell.value);
        }
    }
    return found;
}

// Every number that xlrd reads as the cached result equals LibreOffice's own.
void expectSameNumbers(const SheetValues& cached, const SheetValues& recalculated)
{
    int compared = 0;
    for (const auto& [position, cell] : cached) {
        if (cell.type != "number") {
            continue;
        }
        const auto other = recalculated.find(position);
        ASSERT_NE(other, recalculated.end()) << "row " << position.first << " column " << position.second;
        if (other->second.type == "float") {
            EXPECT_DOUBLE_EQ(std::stod(other->second.value), std::stod(cell.value))
                << "row " << position.first << " column " << position.second;
            ++compared;
        }
    }
    EXPECT_GT(compared, 0);
}

class PenmoorBuildInterop : public ::testing::Test {
protected:
    void SetUp() override
    {
        PENMOOR_NEED_READER(reader::hasPythonModule("xlrd"), "python3-xlrd");
        PENMOOR_NEED_READER(reader::hasProgram("soffice"), "LibreOffice");
    }

    fs::path build(const std::vector<std::string>& arguments)
    {
        std::vector<std::string> words = arguments;
        words.push_back("-o");
        words.push_back((m_folder / "plan.xls").string());
        const auto result = runPenmoorBuild(words);
        EXPECT_EQ(result.exitCode, 0) << result.errors;
        return m_folder / "plan.xls";
    }

    TemporaryFolder m_folder;
};

TEST_F(PenmoorBuildInterop, ByYearWithAnEditedListOpensAndAddsUpElsewhere)
{
    std::vector<std::string> items { kDefaultItemNames.begin(), kDefaultItemNames.end() };
    items.insert(items.begin() + 4, "  Grants (leading blanks)");
    items.insert(items.begin() + 5, "=1+1");
    items.insert(items.begin() + 6, "Miete & Nebenkosten (€)");
    std::string list;
    for (const std::string& item : items) {
        list += item + "\n";
    }
    reader::writeFile(m_folder / "items.txt", list);

    const fs::path file = build(
        { "--company", "Harlenby & Söhne", "--by-year", "1990", "2000", "--items", (m_folder / "items.txt").string() });
    const XlrdView cached = readWithXlrd(file);
    EXPECT_EQ(cached.sheetCount, 1);
    EXPECT_EQ(cached.sheetName, "CashFlow");
    EXPECT_EQ(text(cached.cells, 1, 1), "Cash flow");
    EXPECT_EQ(text(cached.cells, 1, 7), "Harlenby & Söhne");
    EXPECT_EQ(text(cached.cells, 3, 2), "Pre-Startup EST");
    // Eleven year columns D to N, then the total column O.
    EXPECT_EQ(number(cached.cells, 3, 3), 1990);
    EXPECT_EQ(number(cached.cells, 3, 13), 2000);
    EXPECT_EQ(text(cached.cells, 3, 14), "Total Item EST");

    // Every item label as written, the leading "_" dropped and nothing turned into a formula.
    std::vector<std::string> expectedLabels;
    for (const std::string& item : items) {
        expectedLabels.push_back(item.front() == '_' ? item.substr(1) : item);
    }
    EXPECT_EQ(labels(cached.cells), expectedLabels);

    expectSameNumbers(cached.cells, readWithLibreOffice(file, m_folder.path()));
}

TEST_F(PenmoorBuildInterop, ByMonthDefaultsAndByWeekOpenElsewhere)
{
    const fs::path byMonth = build({ "--by-month", "2013", "2014" });
    const XlrdView months = readWithXlrd(byMonth);
    EXPECT_EQ(months.sheetName, "CashFlow");
    // 1 January 2013 and the 24 months after it, up to the total column AB.
    EXPECT_EQ(number(months.cells, 3, 3), 41275);
    EXPECT_EQ(number(months.cells, 3, 4), 41306);
    EXPECT_EQ(text(months.cells, 3, 27), "Total Item EST");
    std::vector<std::string> defaults;
    for (const std::string_view name : kDefaultItemNames) {
        defaults.emplace_back(name.front() == '_' ? name.substr(1) : name);
    }
    EXPECT_EQ(labels(months.cells), defaults);
    const SheetValues recalculated = readWithLibreOffice(byMonth, m_folder.path());
    // LibreOffice shows the recomputed month headers as dates.
    ASSERT_TRUE(recalculated.count({ 3, 26 }));
    EXPECT_EQ(recalculated.at({ 3, 26 }).value, "2014-12-01");

    const fs::path byWeek = build({ "--by-week", "100" });
    const XlrdView weeks = readWithXlrd(byWeek);
    EXPECT_EQ(text(weeks.cells, 3, 3), "Week 1");
    EXPECT_EQ(text(weeks.cells, 3, 102), "Week 100");
    EXPECT_EQ(text(weeks.cells, 3, 103), "Total Item EST");
    expectSameNumbers(weeks.cells, readWithLibreOffice(byWeek, m_folder.path()));
}

TEST_F(PenmoorBuildInterop, WritesThePictureAsPng)
{
    const fs::path picture = m_folder / "plan.png";
    build({ "--picture", picture.string() });
    const std::vector<std::uint8_t> bytes = reader::readFile(picture);
    ASSERT_GT(bytes.size(), 24u);
    EXPECT_EQ(std::vector(bytes.begin(), bytes.begin() + 8),
        (std::vector<std::uint8_t> { 0x89, 'P', 'N', 'G', '\r', '\n', 0x1A, '\n' }));
    const auto big = [&](std::size_t at) {
        return (bytes[at] << 24) | (bytes[at + 1] << 16) | (bytes[at + 2] << 8) | bytes[at + 3];
    };
    // A sheet of sixteen columns and some fifty rows is wider than tall, and no thumbnail.
    EXPECT_GT(big(16), 800);
    EXPECT_GT(big(20), 600);
}

} // namespace
} // namespace penmoor
