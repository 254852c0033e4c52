#pragma once

#include "formatting.h"
#include "picture.h"
#include "value.h"

#include <memory>
#include <string>

namespace xl {

// A range of cells of one worksheet: a cell, a block, whole rows, whole columns or the whole
// sheet, or the row or column collection of such a range (Rows, Columns), whose count and
// items are then rows or columns instead of cells.
//
// Properties act on every cell of the range, with the spreadsheet application's meaning for
// whole rows, whole columns and the whole sheet (their format is kept once, and cells created
// later inherit it). Reading a property gives the value of the top-left cell.
//
// Every failure raises xl::Error.
class Range {
public:
    virtual ~Range() = default;

    // Makes the range the selection and its top-left cell the active cell.
    virtual void Select() = 0;
    // Removes contents and formats; row heights and column widths stay.
    virtual void Clear() = 0;
    // Merges the range into one cell; a single cell stays as it is.
    virtual void Merge() = 0;

    // Absolute A1 address such as "$B$4:$P$51".
    virtual std::string Address() const = 0;
    // Sheet row and column number (1-based) of the top-left cell.
    virtual int Row() const = 0;
    virtual int Column() const = 0;
    // Number of cells, or of rows or columns for a collection from Rows or Columns.
    virtual long long count() const = 0;
    // The rows or columns of this range, as a collection.
    virtual std::unique_ptr<xl::Range> Rows() = 0;
    virtual std::unique_ptr<xl::Range> Columns() = 0;
    // The index-th (1-based) cell, or row or column of a collection.
    virtual std::unique_ptr<xl::Range> Item(long long index) = 0;

    virtual int HorizontalAlignment() const = 0;
    virtual void setHorizontalAlignment(int alignment) = 0;
    virtual int VerticalAlignment() const = 0;
    virtual void setVerticalAlignment(int alignment) = 0;
    virtual bool WrapText() const = 0;
    virtual void setWrapText(bool wrap) = 0;
    // Height of the range's rows in points (0 to 409).
    virtual double RowHeight() const = 0;
    virtual void setRowHeight(double points) = 0;
    // Width of the range's columns in characters of the standard font (0 to 255).
    virtual double ColumnWidth() const = 0;
    virtual void setColumnWidth(double characters) = 0;
    virtual std::string NumberFormat() const = 0;
    virtual void setNumberFormat(const std::string& format) = 0;

    virtual std::unique_ptr<xl::Font> Font() = 0;
    virtual std::unique_ptr<xl::Interior> Interior() = 0;
    virtual std::unique_ptr<xl::Border> Borders(int edge) = 0;

    // Cell entry with the application's rules: "=" starts an R1C1 formula, a number, a
    // percentage or a date becomes a value, a leading apostrophe makes the rest text, anything
    // else is text. Reading gives the formula of the top-left cell in R1C1 form, or its
    // constant as entered.
    virtual std::string FormulaR1C1() const = 0;
    virtual void setFormulaR1C1(const std::string& text) = 0;
    // Stores the text as it stands, without any of the entry rules: for labels that must never
    // become a formula, number or date.
    virtual void setLiteralText(const std::string& text) = 0;
    // Current value of the top-left cell (a formula's result).
    virtual xl::Value Value() const = 0;

    // A picture of the range as the application shows it.
    virtual xl::Picture CopyPicture() = 0;
};

} // namespace xl
