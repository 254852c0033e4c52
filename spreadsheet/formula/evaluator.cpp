#include "spreadsheet/formula/evaluator.h"

#include "spreadsheet/formula/functions.h"
#include "spreadsheet/workbook/text.h"

#include <algorithm>
#include <cmath>
#include <optional>
#include <vector>

namespace penmoor::engine {

namespace {

const xl::ErrorValue* errorOf(const xl::Value& value)
{
    return std::get_if<xl::ErrorValue>(&value);
}

template <class T> const xl::ErrorValue* errorOf(const Result<T>& result)
{
    return std::get_if<xl::ErrorValue>(&result);
}

xl::Value arithmetic(Operator op, double a, double b)
{
    switch (op) {
    case Operator::Add:
        return numberValue(a + b);
    case Operator::Subtract:
        return numberValue(a - b);
    case Operator::Multiply:
        return numberValue(a * b);
    case Operator::Divide:
        return b == 0.0 ? xl::Value(xl::ErrorValue::Div0) : numberValue(a / b);
    case Operator::Power:
        if (a == 0.0 && b == 0.0)
            return xl::ErrorValue::Num;
        if (a == 0.0 && b < 0.0)
            return xl::ErrorValue::Div0;
        if (a < 0.0 && b != std::trunc(b))
            return xl::ErrorValue::Num;
        return numberValue(std::pow(a, b));
    default:
        return xl::ErrorValue::Value;
    }
}

// Orders values as the comparison operators do: numbers before text before booleans; text
// without regard to letter case; an empty cell as 0, "" or FALSE after the other side.
int compareValues(xl::Value a, xl::Value b)
{
    const auto emptyLike = [](const xl::Value& other) -> xl::Value {
        if (std::holds_alternative<std::string>(other))
            return std::string();
        if (std::holds_alternative<bool>(other))
            return false;
        return 0.0;
    };
    if (std::holds_alternative<std::monostate>(a))
        a = emptyLike(b);
    if (std::holds_alternative<std::monostate>(b))
        b = emptyLike(a);
    const auto rank = [](const xl::Value& value) {
        return std::holds_alternative<double>(value) ? 0 : std::holds_alternative<std::string>(value) ? 1 : 2;
    };
    if (rank(a) != rank(b))
        return rank(a) < rank(b) ? -1 : 1;
    if (const double* x = std::get_if<double>(&a)) {
        const double y = std::get<double>(b);
        return *x < y ? -1 : *x > y ? 1 : 0;
    }
    if (const std::string* x = std::get_if<std::string>(&a))
        return compareIgnoringCase(*x, std::get<std::string>(b));
    const bool x = std::get<bool>(a);
    const bool y = std::get<bool>(b);
    return x == y ? 0 : (x ? 1 : -1);
}

xl::Value binary(Operator op, const xl::Value& a, const xl::Value& b)
{
    if (op == Operator::Concatenate) {
        const Result<std::string> left = toText(a);
        const Result<std::string> right = toText(b);
        if (const xl::ErrorValue* error = errorOf(left))
            return *error;
        if (const xl::ErrorValue* error = errorOf(right))
            return *error;
        std::string text = std::get<std::string>(left) + std::get<std::string>(right);
        if (text.size() > kMaxTextLength)
            return xl::ErrorValue::Value;
        return text;
    }
    const bool comparison = op >= Operator::Less && op <= Operator::NotEqual;
    if (comparison) {
        if (const xl::ErrorValue* error = errorOf(a))
            return *error;
        if (const xl::ErrorValue* error = errorOf(b))
            return *error;
        const int order = compareValues(a, b);
        switch (op) {
        case Operator::Less:
            return order < 0;
        case Operator::LessEqual:
            return order <= 0;
        case Operator::Equal:
            return order == 0;
        case Operator::GreaterEqual:
            return order >= 0;
        case Operator::Greater:
            return order > 0;
        default:
            return order != 0;
        }
    }
    const Result<double> left = toNumber(a);
    if (const xl::ErrorValue* error = errorOf(left))
        return *error;
    const Result<double> right = toNumber(b);
    if (const xl::ErrorValue* error = errorOf(right))
        return *error;
    return arithmetic(op, std::get<double>(left), std::get<double>(right));
}

xl::Value unary(Operator op, const xl::Value& operand)
{
    if (op == Operator::UnaryPlus)
        return operand;
    const Result<double> number = toNumber(operand);
    if (const xl::ErrorValue* error = errorOf(number))
        return *error;
    return numberValue(op == Operator::UnaryMinus ? -std::get<double>(number) : std::get<double>(number) / 100.0);
}

class Evaluation {
public:
    Evaluation(CellPosition origin, const CellValueSource& cells)
        : m_origin(origin)
        , m_cells(cells)
    {
    }

    // False when the tokens do not form a formula.
    bool run(const TokenArray& tokens)
    {
        for (const Token& token : tokens) {
            if (!std::visit([this](const auto& t) { return step(t); }, token))
                return false;
        }
        return m_stack.size() == 1;
    }

    xl::Value result() const
    {
        xl::Value value = scalarValue(m_stack.back(), m_origin, m_cells);
        if (std::holds_alternative<std::monostate>(value))
            return 0.0;
        return value;
    }

private:
    bool push(xl::Value value)
    {
        m_stack.push_back(Operand::of(std::move(value)));
        return true;
    }
    xl::Value popScalar()
    {
        xl::Value value = scalarValue(m_stack.back(), m_origin, m_cells);
        m_stack.pop_back();
        return value;
    }

    bool step(const NumberToken& t) { return push(t.value); }
    bool step(const StringToken& t) { return push(t.value); }
    bool step(const BooleanToken& t) { return push(t.value); }
    bool step(const ErrorToken& t) { return push(t.value); }
    bool step(const NameToken&) { return push(xl::ErrorValue::Name); }
    bool step(const ParenthesisToken&) { return !m_stack.empty(); }
    bool step(const MissingArgumentToken&)
    {
        m_stack.push_back(Operand::missing());
        return true;
    }
    bool step(const ReferenceToken& t) { return pushArea(resolveArea(t.cell, t.cell, m_origin)); }
    bool step(const AreaToken& t) { return pushArea(resolveArea(t.first, t.last, m_origin)); }

    bool pushArea(const std::optional<Region>& area)
    {
        if (!area)
            return push(xl::ErrorValue::Ref);
        m_stack.push_back(Operand::reference(*area));
        return true;
    }

    bool step(const OperatorToken& t)
    {
        const bool isUnary = t.op == Operator::UnaryPlus || t.op == Operator::UnaryMinus || t.op == Operator::Percent;
        if (m_stack.size() < (isUnary ? 1u : 2u))
            return false;
        if (isUnary)
            return push(unary(t.op, popScalar()));
        const xl::Value right = popScalar();
        const xl::Value left = popScalar();
        return push(binary(t.op, left, right));
    }

    bool step(const FunctionToken& t)
    {
        if (m_stack.size() < t.argumentCount)
            return false;
        const std::size_t first = m_stack.size() - t.argumentCount;
        Operand result = callFunction(
            t.functionIndex, std::span<const Operand>(m_stack.data() + first, t.argumentCount), m_origin, m_cells);
        m_stack.resize(first);
        m_stack.push_back(std::move(result));
        return true;
    }

    CellPosition m_origin;
    const CellValueSource& m_cells;
    std::vector<Operand> m_stack;
};

} // namespace

xl::Value evaluateFormula(const TokenArray& tokens, CellPosition origin, const CellValueSource& cells)
{
    Evaluation evaluation(origin, cells);
    if (!evaluation.run(tokens))
        return xl::ErrorValue::Value;
    return evaluation.result();
}

} // namespace penmoor::engine
