#pragma once

#include "automation/contract/value.h"
#include "spreadsheet/formula/token.h"
#include "spreadsheet/workbook/address.h"

#include <functional>
#include <optional>
#include <string>
#include <variant>

namespace penmoor::engine {

// Where a formula reads the cells of its sheet.
class CellValueSource {
public:
    virtual ~CellValueSource() = default;

    // The cell's value; empty for an empty cell.
    virtual xl::Value value(CellPosition position) const = 0;
    // visit(value) for every cell of the region that holds content, row by row; stops early
    // once visit returns false.
    virtual void forEachValue(const Region& region, const std::function<bool(const xl::Value&)>& visit) const = 0;
};

// A value on the evaluation stack: a plain value, a reference to cells of the sheet (which
// functions such as SUM read as a block), or an omitted argument.
struct Operand {
    enum class Kind { Value, Reference, Missing };

    Kind kind = Kind::Value;
    xl::Value value;
    Region area;

    static Operand of(xl::Value value) { return { Kind::Value, std::move(value), {} }; }
    static Operand reference(const Region& area) { return { Kind::Reference, {}, area }; }
    static Operand missing() { return { Kind::Missing, {}, {} }; }
};

// A converted value, or the error that stands for it.
template <class T> using Result = std::variant<T, xl::ErrorValue>;

// The longest text a cell can hold.
inline constexpr std::size_t kMaxTextLength = 32767;

// Conversions of the application's operators: an empty cell is 0, "" or FALSE; TRUE is 1;
// text is a number when it reads as one (numbers, percentages, dates), else #VALUE!; an error
// stays that error.
Result<double> toNumber(const xl::Value& value);
Result<bool> toBoolean(const xl::Value& value);
Result<std::string> toText(const xl::Value& value);

// A number result as a value: #NUM! where the arithmetic overflowed.
xl::Value numberValue(double number);

// The block from one reference to another (the same for a single cell) as seen from a formula
// in `origin`, or nothing when any corner falls off the sheet.
std::optional<Region> resolveArea(const CellReference& first, const CellReference& last, CellPosition origin);

// The single value an operand stands for in a formula at `origin`: a reference to one cell
// gives that cell's value; a block gives the cell in the formula's row (for a single column)
// or column (for a single row), else #VALUE!.
xl::Value scalarValue(const Operand& operand, CellPosition origin, const CellValueSource& cells);

} // namespace penmoor::engine
