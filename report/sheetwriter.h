#pragma once

#include "automation/contract/application.h"

#include <string>

namespace penmoor {

// How PutCell enters its text.
enum class CellEntry {
    Typed, // as if typed: "=" starts an R1C1 formula, numbers and dates become values
    Literal, // exactly the text, never a formula, number or date (labels, the company name)
};

// The sheet writing primitives: each selects the range it is given (or, where the range may be
// empty, keeps the current selection) and then sets properties of the selection, the active
// cell or the active sheet's page setup, in a fixed order. So a primitive that acts on the
// selection acts on whatever the call before it selected. Failures of the application (xl::Error)
// pass through unchanged.
class SheetWriter {
public:
    explicit SheetWriter(xl::Application& application);

    xl::Application& application() { return m_application; }

    // Range(address).Select.
    void Select(const std::string& address);

    // Centres the selection horizontally and/or vertically and/or wraps its text; a false
    // argument leaves that property alone.
    void SetAlignment(bool horizontal, bool vertical, bool wrap);
    // Thin lines in colour 16 on the outline of the selection and between all its cells.
    void SetAllBorders();
    // A thin line in the colour on one edge of the selection (xl::kEdgeLeft ... kInsideHorizontal).
    void SetBorder(int edge, int colorIndex);
    // No line on one edge of the selection.
    void ClearBorder(int edge);
    // Selects the rows ("5:5") and sets their height in points.
    void SetRowHeight(const std::string& rows, double height);
    // Selects the columns ("A:A") and sets their width in characters.
    void SetColumnWidth(const std::string& columns, double width);
    // Selects range unless it is empty, then fills the selection with the palette colour.
    void SetFill(const std::string& range, int colorIndex);
    // Selects range, enters text into its active cell, and merges the selection when asked (a
    // single cell stays as it is).
    void PutCell(const std::string& range, const std::string& text, bool merge, CellEntry entry = CellEntry::Typed);
    // Font style ("Bold"), size in points and colour index of the selection, in that order.
    void SetFont(const std::string& style, double size, int colorIndex);
    // Selects range unless it is empty, then gives the selection the number format.
    void SetNumberFormat(const std::string& range, const std::string& format);
    // The active sheet's print area, then its margins, comments, landscape A4 paper and a scale
    // that fits the print area on one page.
    void SetupPage(const std::string& printArea);

private:
    xl::Application& m_application;
};

} // namespace penmoor
