#include "tests/xls/support/sampleworkbooks.h"

#include "spreadsheet/workbook/formatting.h"

namespace penmoor::xls::test {

namespace {

using namespace engine;

ReferenceToken relative(int rows, int columns)
{
    return ReferenceToken { { { rows, true }, { columns, true } } };
}

Formula formula(TokenArray tokens, xl::Value cached)
{
    return Formula { std::move(tokens), std::move(cached) };
}

void format(Workbook& book, Sheet& sheet, const Region& region, const std::function<void(CellStyle&)>& change)
{
    applyFormat(book.styles(), sheet, region, change);
}

void grid(Workbook& book, Sheet& sheet, const Region& region, std::uint8_t colour)
{
    format(book, sheet, region, [&](CellStyle& style) {
        for (Edge& edge : style.edges)
            edge = { LineStyle::Thin, colour };
    });
}

} // namespace

Workbook cashFlowSample()
{
    Workbook book;
    Sheet& sheet = book.addSheet("CashFlow");
    for (int k = 1; k <= 56; ++k)
        book.setColor(k, static_cast<std::uint32_t>((k * 0x050301 + 0x102030) & 0xFFFFFF));
    book.setColor(2, 0xFFFFFF);
    book.setColor(12, 0x5F5237);
    book.setColor(16, 0x808080);
    book.setColor(39, 0xD7FFE0);
    book.setColor(55, 0xCCFFCC);

    format(book, sheet, Region::wholeSheet(), [](CellStyle& style) {
        style.font.name = "Arial";
        style.fillColorIndex = 2;
    });
    const double widths[] = { 1, 32, 10.83, 8.33, 8.33, 8.33, 9.17 };
    for (int column = 1; column <= 7; ++column)
        sheet.setColumnWidth(column, widths[column - 1]);
    const double heights[] = { 11.25, 27.75, 3.75, 24.75, 18, 18, 24 };
    for (int row = 1; row <= 7; ++row)
        sheet.setRowHeight(row, heights[row - 1]);

    sheet.setContent({ 2, 2 }, std::string("Cash flow"));
    format(book, sheet, Region::cell(2, 2), [](CellStyle& style) {
        style.font.bold = true;
        style.font.sizePoints = 19;
        style.font.colorIndex = 12;
    });
    sheet.setContent({ 2, 5 }, std::string("Harlenby & Söhne — 現金"));
    sheet.merge({ 2, 5, 2, 7 });
    format(book, sheet, Region::cell(2, 5), [](CellStyle& style) {
        style.font.bold = true;
        style.font.sizePoints = 12;
    });

    // Heading row: labels, the first month as a date, later months one month on by formula.
    sheet.setContent({ 4, 3 }, std::string("Pre-Startup EST"));
    sheet.setContent({ 4, 4 }, 41275.0);
    const TokenArray nextMonth { relative(0, -1), FunctionToken { 69, 1, {} }, relative(0, -1),
        FunctionToken { 68, 1, {} }, NumberToken { 1 }, OperatorToken { Operator::Add }, NumberToken { 1 },
        FunctionToken { 65, 3, {} } };
    sheet.setContent({ 4, 5 }, formula(nextMonth, 41306.0));
    sheet.setContent({ 4, 6 }, formula(nextMonth, 41334.0));
    sheet.setContent({ 4, 7 }, std::string("Total Item EST"));
    format(book, sheet, { 4, 3, 4, 7 }, [](CellStyle& style) {
        style.font.bold = true;
        style.font.sizePoints = 9;
        style.fillColorIndex = 55;
        style.horizontal = HorizontalAlignment::Center;
        style.vertical = VerticalAlignment::Center;
        style.wrapText = true;
    });
    format(book, sheet, { 4, 4, 4, 6 }, [](CellStyle& style) { style.numberFormat = "mmm-yy"; });

    // Items and their totals.
    sheet.setContent({ 5, 2 }, std::string("Cash Sales"));
    sheet.setContent({ 6, 2 }, std::string("Collections from CR accounts"));
    sheet.setContent({ 7, 2 }, std::string("TOTAL CASH RECEIPTS"));
    const double sales[] = { 100, 1250.5, 99999, -3 };
    const double collections[] = { 250, 0.25, 1, 3 };
    for (int i = 0; i < 4; ++i) {
        sheet.setContent({ 5, 3 + i }, sales[i]);
        sheet.setContent({ 6, 3 + i }, collections[i]);
        sheet.setContent({ 7, 3 + i },
            formula({ relative(-2, 0), relative(-1, 0), OperatorToken { Operator::Add } }, sales[i] + collections[i]));
    }
    // The total column sums the row; its difference form checks subtraction.
    sheet.setContent({ 5, 7 },
        formula(
            { AreaToken { { { 0, true }, { -4, true } }, { { 0, true }, { -1, true } } }, FunctionToken { 4, 1, {} } },
            100 + 1250.5 + 99999 - 3));
    sheet.setContent({ 6, 7 },
        formula({ relative(-1, 0), relative(0, -1), OperatorToken { Operator::Subtract }, ParenthesisToken {} },
            (100 + 1250.5 + 99999 - 3) - 3));
    format(book, sheet, { 7, 2, 7, 7 }, [](CellStyle& style) { style.fillColorIndex = 39; });
    format(book, sheet, { 7, 2, 7, 2 }, [](CellStyle& style) {
        style.font.bold = true;
        style.fillColorIndex = 55;
    });

    grid(book, sheet, { 4, 2, 7, 7 }, 16);
    format(book, sheet, Region::cell(4, 2), [](CellStyle& style) {
        style.edge(EdgeSide::Top) = {};
        style.edge(EdgeSide::Left) = {};
    });
    format(book, sheet, { 4, 2, 7, 7 }, [](CellStyle& style) { style.vertical = VerticalAlignment::Center; });
    format(book, sheet, { 5, 3, 9, 7 }, [](CellStyle& style) { style.numberFormat = "#,##0"; });

    PageSetup& page = sheet.pageSetup();
    page.printArea = Region { 1, 1, 9, 7 };
    page.leftMarginInches = page.rightMarginInches = 0.7;
    page.topMarginInches = page.bottomMarginInches = 0.5;
    page.headerMarginInches = page.footerMarginInches = 0;
    page.orientation = Orientation::Landscape;
    page.paperSize = 9;
    page.zoomPercent.reset();
    page.fitToPagesWide = page.fitToPagesTall = 1;
    page.comments = CommentPrinting::None;
    sheet.select(Region::cell(5, 3), { 5, 3 });
    return book;
}

void addOddsAndEnds(Workbook& book)
{
    Sheet& sheet = book.addSheet("Odds & Ends");
    sheet.setContent({ 1, 1 }, true);
    sheet.setContent({ 1, 2 }, false);
    sheet.setContent({ 1, 3 }, xl::ErrorValue::Div0);
    sheet.setContent({ 1, 4 }, xl::ErrorValue::NA);
    std::string longText;
    for (int i = 0; i < 1500; ++i)
        longText += "Ωmega " + std::to_string(i) + "; ";
    sheet.setContent({ 2, 1 }, longText);
    sheet.setContent({ 3, 1 },
        formula({ StringToken { "a\"b" }, StringToken { "ü" }, OperatorToken { Operator::Concatenate } },
            std::string("a\"bü")));
    sheet.setContent({ 3, 2 }, formula({ StringToken { "" } }, std::string()));
    sheet.setContent(
        { 3, 3 }, formula({ NumberToken { 1 }, NumberToken { 2 }, OperatorToken { Operator::Less } }, true));
    sheet.setContent({ 3, 4 },
        formula({ NumberToken { 1 }, NumberToken { 0 }, OperatorToken { Operator::Divide } }, xl::ErrorValue::Div0));
    sheet.setContent({ 3, 5 }, formula({ relative(-70000, 0) }, xl::ErrorValue::Ref));
    sheet.setContent({ 3, 6 },
        formula({ NumberToken { -2.5 }, NumberToken { 70000 }, OperatorToken { Operator::Multiply },
                    OperatorToken { Operator::UnaryMinus } },
            175000.0));
    sheet.setContent({ 4, 1 }, 1e-300);
    sheet.setContent({ 4, 2 }, -0.5);
    sheet.setContent({ 4, 3 }, 123456789.125);
    format(book, sheet, Region::rows(6, 6), [](CellStyle& style) {
        style.font.italic = true;
        style.fillColorIndex = 6;
    });
    format(book, sheet, Region::columns(8, 9), [](CellStyle& style) {
        style.horizontal = HorizontalAlignment::Right;
        style.edge(EdgeSide::Bottom) = { LineStyle::Medium, kAutomaticColor };
        style.edge(EdgeSide::Right) = { LineStyle::Thick, 3 };
        style.edge(EdgeSide::Left) = { LineStyle::Hair, 10 };
        style.numberFormat = "0.000;[Red]-0.000";
    });
    sheet.setContent({ 6, 8 }, 2.5);
    sheet.setRowHeight(8, 0);
    sheet.setColumnWidth(10, 0);
    sheet.setColumnWidth(11, 255);
    PageSetup& page = sheet.pageSetup();
    page.zoomPercent = 85;
    page.paperSize = 1;
    page.comments = CommentPrinting::AtEnd;
    sheet.select({ 2, 2, 5, 4 }, { 3, 3 });
}

Workbook largeSample(int rows, int columns)
{
    Workbook book;
    Sheet& sheet = book.addSheet("Large");
    const Region table { 1, 1, rows, columns };
    format(book, sheet, Region::wholeSheet(), [](CellStyle& style) { style.fillColorIndex = 2; });
    grid(book, sheet, table, 16);
    format(book, sheet, table, [](CellStyle& style) { style.numberFormat = "#,##0"; });
    for (int row = 1; row <= rows; ++row) {
        sheet.setContent({ row, 2 }, "Item " + std::to_string(row));
        if (row % 10 == 0 && row > 2)
            sheet.setContent(
                { row, 3 }, formula({ relative(-2, 0), relative(-1, 0), OperatorToken { Operator::Add } }, 0.0));
    }
    return book;
}

} // namespace penmoor::xls::test
