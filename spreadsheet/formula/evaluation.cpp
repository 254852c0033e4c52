#include "spreadsheet/formula/evaluation.h"

#include "spreadsheet/formula/valuetext.h"
#include "spreadsheet/workbook/text.h"

#include <algorithm>
#include <cmath>
#include <optional>

namespace penmoor::engine {

Result<double> toNumber(const xl::Value& value)
{
    if (const double* number = std::get_if<double>(&value))
        return *number;
    if (const bool* flag = std::get_if<bool>(&value))
        return *flag ? 1.0 : 0.0;
    if (const xl::ErrorValue* error = std::get_if<xl::ErrorValue>(&value))
        return *error;
    if (const std::string* text = std::get_if<std::string>(&value)) {
        if (const std::optional<ParsedNumber> parsed = parseNumberText(*text))
            return parsed->value;
        return xl::ErrorValue::Value;
    }
    return 0.0;
}

Result<bool> toBoolean(const xl::Value& value)
{
    if (const std::string* text = std::get_if<std::string>(&value)) {
        if (equalsIgnoringCase(*text, "TRUE"))
            return true;
        if (equalsIgnoringCase(*text, "FALSE"))
            return false;
        return xl::ErrorValue::Value;
    }
    const Result<double> number = toNumber(value);
    if (const xl::ErrorValue* error = std::get_if<xl::ErrorValue>(&number))
        return *error;
    return std::get<double>(number) != 0.0;
}

Result<std::string> toText(const xl::Value& value)
{
    if (const std::string* text = std::get_if<std::string>(&value))
        return *text;
    if (const double* number = std::get_if<double>(&value))
        return numberText(*number);
    if (const bool* flag = std::get_if<bool>(&value))
        return std::string(*flag ? "TRUE" : "FALSE");
    if (const xl::ErrorValue* error = std::get_if<xl::ErrorValue>(&value))
        return *error;
    return std::string();
}

xl::Value numberValue(double number)
{
    if (!std::isfinite(number))
        return xl::ErrorValue::Num;
    return number == 0.0 ? 0.0 : number; // no negative zero
}

std::optional<Region> resolveArea(const CellReference& first, const CellReference& last, CellPosition origin)
{
    const int row1 = first.row.resolve(origin.row);
    const int column1 = first.column.resolve(origin.column);
    const int row2 = last.row.resolve(origin.row);
    const int column2 = last.column.resolve(origin.column);
    const Region area { std::min(row1, row2), std::min(column1, column2), std::max(row1, row2),
        std::max(column1, column2) };
    if (!area.isValid())
        return std::nullopt;
    return area;
}

xl::Value scalarValue(const Operand& operand, CellPosition origin, const CellValueSource& cells)
{
    switch (operand.kind) {
    case Operand::Kind::Value:
        return operand.value;
    case Operand::Kind::Missing:
        return {};
    case Operand::Kind::Reference:
        break;
    }
    const Region& area = operand.area;
    if (area.isSingleCell())
        return cells.value(area.topLeft());
    if (area.columnCount() == 1 && origin.row >= area.firstRow && origin.row <= area.lastRow)
        return cells.value({ origin.row, area.firstColumn });
    if (area.rowCount() == 1 && origin.column >= area.firstColumn && origin.column <= area.lastColumn)
        return cells.value({ area.firstRow, origin.column });
    return xl::ErrorValue::Value;
}

} // namespace penmoor::engine
