#include "spreadsheet/formula/functions.h"

#include "spreadsheet/formula/dates.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <optional>

namespace penmoor::engine {

namespace {

// Function numbers of the .xls function table (see functiontable.cpp).
enum FunctionIndex : std::uint16_t {
    kCount = 0,
    kIf = 1,
    kSum = 4,
    kAverage = 5,
    kMin = 6,
    kMax = 7,
    kAbs = 24,
    kInt = 25,
    kTrue = 34,
    kFalse = 35,
    kAnd = 36,
    kOr = 37,
    kNot = 38,
    kDate = 65,
    kDay = 67,
    kMonth = 68,
    kYear = 69,
};

Operand valueOperand(xl::Value value)
{
    return Operand::of(std::move(value));
}

const xl::ErrorValue* errorOf(const Result<double>& result)
{
    return std::get_if<xl::ErrorValue>(&result);
}

// Feeds the numbers of the arguments to `take` as SUM, AVERAGE, MIN and MAX read them: in a
// referenced block only numbers count (text, booleans and empty cells are passed over, an error
// is the result); an argument given directly counts when it converts to a number, and text
// that does not is #VALUE!. Gives the first error met, if any.
template <class Take>
std::optional<xl::ErrorValue> forEachNumber(
    std::span<const Operand> arguments, Take&& take, const CellValueSource& cells)
{
    std::optional<xl::ErrorValue> failure;
    for (const Operand& argument : arguments) {
        if (argument.kind == Operand::Kind::Reference) {
            cells.forEachValue(argument.area, [&](const xl::Value& value) {
                if (const xl::ErrorValue* error = std::get_if<xl::ErrorValue>(&value)) {
                    failure = *error;
                    return false;
                }
                if (const double* number = std::get_if<double>(&value))
                    take(*number);
                return true;
            });
        } else if (argument.kind == Operand::Kind::Missing) {
            take(0.0);
        } else if (!std::holds_alternative<std::monostate>(argument.value)) {
            const Result<double> number = toNumber(argument.value);
            if (const xl::ErrorValue* error = errorOf(number))
                failure = *error;
            else
                take(std::get<double>(number));
        }
        if (failure)
            return failure;
    }
    return std::nullopt;
}

Operand aggregate(std::uint16_t index, std::span<const Operand> arguments, const CellValueSource& cells)
{
    double sum = 0.0;
    double count = 0.0;
    double minimum = std::numeric_limits<double>::infinity();
    double maximum = -std::numeric_limits<double>::infinity();
    const std::optional<xl::ErrorValue> error = forEachNumber(
        arguments,
        [&](double number) {
            sum += number;
            count += 1.0;
            minimum = std::min(minimum, number);
            maximum = std::max(maximum, number);
        },
        cells);
    if (error)
        return valueOperand(*error);
    switch (index) {
    case kSum:
        return valueOperand(numberValue(sum));
    case kAverage:
        return valueOperand(count == 0.0 ? xl::Value(xl::ErrorValue::Div0) : numberValue(sum / count));
    case kMin:
        return valueOperand(count == 0.0 ? 0.0 : minimum);
    default:
        return valueOperand(count == 0.0 ? 0.0 : maximum);
    }
}

// COUNT counts numbers in blocks and arguments that convert to numbers; it never fails.
Operand count(std::span<const Operand> arguments, const CellValueSource& cells)
{
    double counted = 0.0;
    for (const Operand& argument : arguments) {
        if (argument.kind == Operand::Kind::Reference) {
            cells.forEachValue(argument.area, [&](const xl::Value& value) {
                counted += std::holds_alternative<double>(value) ? 1.0 : 0.0;
                return true;
            });
        } else if (argument.kind == Operand::Kind::Value && !std::holds_alternative<std::monostate>(argument.value)
            && std::holds_alternative<double>(toNumber(argument.value))) {
            counted += 1.0;
        }
    }
    return valueOperand(counted);
}

// AND and OR read booleans and numbers, in blocks passing over text and empty cells; with
// nothing to read they give #VALUE!.
Operand logical(bool isAnd, std::span<const Operand> arguments, const CellValueSource& cells)
{
    bool result = isAnd;
    bool any = false;
    std::optional<xl::ErrorValue> failure;
    const auto take = [&](bool flag) {
        any = true;
        result = isAnd ? result && flag : result || flag;
    };
    for (const Operand& argument : arguments) {
        if (argument.kind == Operand::Kind::Reference) {
            cells.forEachValue(argument.area, [&](const xl::Value& value) {
                if (const xl::ErrorValue* error = std::get_if<xl::ErrorValue>(&value)) {
                    failure = *error;
                    return false;
                }
                if (const double* number = std::get_if<double>(&value))
                    take(*number != 0.0);
                else if (const bool* flag = std::get_if<bool>(&value))
                    take(*flag);
                return true;
            });
        } else if (argument.kind == Operand::Kind::Value && !std::holds_alternative<std::monostate>(argument.value)) {
            const Result<bool> flag = toBoolean(argument.value);
            if (const xl::ErrorValue* error = std::get_if<xl::ErrorValue>(&flag))
                failure = *error;
            else
                take(std::get<bool>(flag));
        }
        if (failure)
            return valueOperand(*failure);
    }
    return valueOperand(any ? xl::Value(result) : xl::Value(xl::ErrorValue::Value));
}

// A number argument cut to a whole number, as DATE takes its parts.
Result<int> wholeNumber(const xl::Value& value)
{
    const Result<double> number = toNumber(value);
    if (const xl::ErrorValue* error = errorOf(number))
        return *error;
    const double truncated = std::trunc(std::get<double>(number));
    if (truncated < std::numeric_limits<int>::min() || truncated > std::numeric_limits<int>::max())
        return xl::ErrorValue::Num;
    return static_cast<int>(truncated);
}

Operand date(std::span<const Operand> arguments, CellPosition origin, const CellValueSource& cells)
{
    int parts[3] = {};
    for (std::size_t i = 0; i < 3; ++i) {
        const Result<int> part = wholeNumber(scalarValue(arguments[i], origin, cells));
        if (const xl::ErrorValue* error = std::get_if<xl::ErrorValue>(&part))
            return valueOperand(*error);
        parts[i] = std::get<int>(part);
    }
    const std::optional<int> serial = dateSerial(parts[0], parts[1], parts[2]);
    return valueOperand(serial ? xl::Value(static_cast<double>(*serial)) : xl::Value(xl::ErrorValue::Num));
}

Operand datePart(std::uint16_t index, const xl::Value& argument)
{
    const Result<double> serial = toNumber(argument);
    if (const xl::ErrorValue* error = errorOf(serial))
        return valueOperand(*error);
    const std::optional<CalendarDate> date = calendarDate(std::get<double>(serial));
    if (!date)
        return valueOperand(xl::ErrorValue::Num);
    const int part = index == kYear ? date->year : index == kMonth ? date->month : date->day;
    return valueOperand(static_cast<double>(part));
}

Operand ifFunction(std::span<const Operand> arguments, CellPosition origin, const CellValueSource& cells)
{
    const Result<bool> condition = toBoolean(scalarValue(arguments[0], origin, cells));
    if (const xl::ErrorValue* error = std::get_if<xl::ErrorValue>(&condition))
        return valueOperand(*error);
    if (!std::get<bool>(condition) && arguments.size() < 3)
        return valueOperand(false);
    const Operand& chosen = arguments[std::get<bool>(condition) ? 1 : 2];
    return chosen.kind == Operand::Kind::Missing ? valueOperand(0.0) : chosen;
}

Operand numberFunction(std::uint16_t index, const xl::Value& argument)
{
    const Result<double> number = toNumber(argument);
    if (const xl::ErrorValue* error = errorOf(number))
        return valueOperand(*error);
    const double x = std::get<double>(number);
    return valueOperand(numberValue(index == kAbs ? std::fabs(x) : std::floor(x)));
}

} // namespace

Operand callFunction(
    std::uint16_t index, std::span<const Operand> arguments, CellPosition origin, const CellValueSource& cells)
{
    const auto scalar = [&](std::size_t i) { return scalarValue(arguments[i], origin, cells); };
    switch (index) {
    case kSum:
    case kAverage:
    case kMin:
    case kMax:
        return aggregate(index, arguments, cells);
    case kCount:
        return count(arguments, cells);
    case kAnd:
    case kOr:
        return logical(index == kAnd, arguments, cells);
    case kIf:
        if (arguments.size() >= 2)
            return ifFunction(arguments, origin, cells);
        break;
    case kNot:
        if (arguments.size() == 1) {
            const Result<bool> flag = toBoolean(scalar(0));
            if (const xl::ErrorValue* error = std::get_if<xl::ErrorValue>(&flag))
                return valueOperand(*error);
            return valueOperand(!std::get<bool>(flag));
        }
        break;
    case kAbs:
    case kInt:
        if (arguments.size() == 1)
            return numberFunction(index, scalar(0));
        break;
    case kTrue:
    case kFalse:
        return valueOperand(index == kTrue);
    case kDate:
        if (arguments.size() == 3)
            return date(arguments, origin, cells);
        break;
    case kDay:
    case kMonth:
    case kYear:
        if (arguments.size() == 1)
            return datePart(index, scalar(0));
        break;
    default:
        return valueOperand(xl::ErrorValue::Name);
    }
    // A known function with the wrong number of arguments (only from a file).
    return valueOperand(xl::ErrorValue::Value);
}

} // namespace penmoor::engine
