#include "report/sheetwriter.h"

#include "automation/contract/constants.h"
#include "report/sheetlook.h"

#include <array>
#include <optional>

namespace penmoor {

namespace {

constexpr double kSideMarginInches = 0.7;
constexpr double kTopBottomMarginInches = 0.5;

} // namespace

SheetWriter::SheetWriter(xl::Application& application)
    : m_application(application)
{
}

void SheetWriter::Select(const std::string& address)
{
    m_application.Range(address)->Select();
}

void SheetWriter::SetAlignment(bool horizontal, bool vertical, bool wrap)
{
    const std::unique_ptr<xl::Range> selection = m_application.Selection();
    if (horizontal) {
        selection->setHorizontalAlignment(xl::kAlignCenter);
    }
    if (vertical) {
        selection->setVerticalAlignment(xl::kAlignCenter);
    }
    if (wrap) {
        selection->setWrapText(true);
    }
}

void SheetWriter::SetAllBorders()
{
    constexpr std::array kEdges
        = { xl::kEdgeLeft, xl::kEdgeTop, xl::kEdgeBottom, xl::kEdgeRight, xl::kInsideVertical, xl::kInsideHorizontal };
    for (const int edge : kEdges) {
        SetBorder(edge, kGridColor);
    }
}

void SheetWriter::SetBorder(int edge, int colorIndex)
{
    const std::unique_ptr<xl::Border> border = m_application.Selection()->Borders(edge);
    border->setWeight(xl::kWeightThin);
    border->setColorIndex(colorIndex);
}

void SheetWriter::ClearBorder(int edge)
{
    m_application.Selection()->Borders(edge)->setLineStyle(xl::kLineStyleNone);
}

void SheetWriter::SetRowHeight(const std::string& rows, double height)
{
    m_application.Rows(rows)->Select();
    m_application.Selection()->setRowHeight(height);
}

void SheetWriter::SetColumnWidth(const std::string& columns, double width)
{
    m_application.Columns(columns)->Select();
    m_application.Selection()->setColumnWidth(width);
}

void SheetWriter::SetFill(const std::string& range, int colorIndex)
{
    if (!range.empty()) {
        Select(range);
    }
    m_application.Selection()->Interior()->setColorIndex(colorIndex);
}

void SheetWriter::PutCell(const std::string& range, const std::string& text, bool merge, CellEntry entry)
{
    Select(range);
    const std::unique_ptr<xl::Range> activeCell = m_application.ActiveCell();
    if (entry == CellEntry::Literal) {
        activeCell->setLiteralText(text);
    } else {
        activeCell->setFormulaR1C1(text);
    }
    if (merge) {
        m_application.Selection()->Merge();
    }
}

void SheetWriter::SetFont(const std::string& style, double size, int colorIndex)
{
    const std::unique_ptr<xl::Font> font = m_application.Selection()->Font();
    font->setFontStyle(style);
    font->setSize(size);
    font->setColorIndex(colorIndex);
}

void SheetWriter::SetNumberFormat(const std::string& range, const std::string& format)
{
    if (!range.empty()) {
        Select(range);
    }
    m_application.Selection()->setNumberFormat(format);
}

void SheetWriter::SetupPage(const std::string& printArea)
{
    m_application.ActiveSheet()->PageSetup()->setPrintArea(printArea);

    const std::unique_ptr<xl::PageSetup> page = m_application.ActiveSheet()->PageSetup();
    page->setLeftMargin(m_application.InchesToPoints(kSideMarginInches));
    page->setRightMargin(m_application.InchesToPoints(kSideMarginInches));
    page->setTopMargin(m_application.InchesToPoints(kTopBottomMarginInches));
    page->setBottomMargin(m_application.InchesToPoints(kTopBottomMarginInches));
    page->setHeaderMargin(m_application.InchesToPoints(0));
    page->setFooterMargin(m_application.InchesToPoints(0));
    page->setPrintComments(xl::kPrintNoComments);
    page->setOrientation(xl::kOrientationLandscape);
    page->setPaperSize(xl::kPaperA4);
    // Without a zoom the two fit values decide the scale: one page wide and one page tall.
    page->setZoom(std::nullopt);
    page->setFitToPagesWide(1);
    page->setFitToPagesTall(1);
}

} // namespace penmoor
