#pragma once

#include "automation/contract/range.h"
#include "spreadsheet/builtin/rangetarget.h"

namespace penmoor::engine {

// A range of the built-in application: a block of one sheet, seen as its cells or as the
// collection of its rows or columns.
class BuiltinRange : public xl::Range {
public:
    enum class Collection { Cells, Rows, Columns };

    BuiltinRange(SheetHandle sheet, const Region& region, Collection collection = Collection::Cells);

    void Select() override;
    void Clear() override;
    void Merge() override;

    std::string Address() const override;
    int Row() const override { return m_target.region().firstRow; }
    int Column() const override { return m_target.region().firstColumn; }
    long long count() const override;
    std::unique_ptr<xl::Range> Rows() override;
    std::unique_ptr<xl::Range> Columns() override;
    std::unique_ptr<xl::Range> Item(long long index) override;

    int HorizontalAlignment() const override;
    void setHorizontalAlignment(int alignment) override;
    int VerticalAlignment() const override;
    void setVerticalAlignment(int alignment) override;
    bool WrapText() const override;
    void setWrapText(bool wrap) override;
    double RowHeight() const override;
    void setRowHeight(double points) override;
    double ColumnWidth() const override;
    void setColumnWidth(double characters) override;
    std::string NumberFormat() const override;
    void setNumberFormat(const std::string& format) override;

    std::unique_ptr<xl::Font> Font() override;
    std::unique_ptr<xl::Interior> Interior() override;
    std::unique_ptr<xl::Border> Borders(int edge) override;

    std::string FormulaR1C1() const override;
    void setFormulaR1C1(const std::string& text) override;
    void setLiteralText(const std::string& text) override;
    xl::Value Value() const override;

    xl::Picture CopyPicture() override;

private:
    // Calls store(cell) for every cell of the range, refusing blocks too large to fill.
    void forEachCellToFill(const std::function<void(CellPosition)>& store) const;
    const Region& region() const { return m_target.region(); }

    RangeTarget m_target;
    Collection m_collection;
};

} // namespace penmoor::engine
