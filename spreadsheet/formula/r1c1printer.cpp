#include "spreadsheet/formula/r1c1printer.h"

#include "automation/contract/error.h"
#include "spreadsheet/formula/functiontable.h"
#include "spreadsheet/formula/valuetext.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <vector>

namespace penmoor::engine {

namespace {

// How tightly a printed piece holds together; a piece looser than its operator needs
// parentheses.
enum Precedence : int {
    kComparison = 1,
    kConcatenation,
    kAdditive,
    kMultiplicative,
    kPower,
    kPercent,
    kUnary,
    kOperand,
};

struct Piece {
    std::string text;
    int precedence = kOperand;
};

struct OperatorInfo {
    std::string_view symbol;
    int precedence;
};

OperatorInfo operatorInfo(Operator op)
{
    switch (op) {
    case Operator::Add:
        return { "+", kAdditive };
    case Operator::Subtract:
        return { "-", kAdditive };
    case Operator::Multiply:
        return { "*", kMultiplicative };
    case Operator::Divide:
        return { "/", kMultiplicative };
    case Operator::Power:
        return { "^", kPower };
    case Operator::Concatenate:
        return { "&", kConcatenation };
    case Operator::Less:
        return { "<", kComparison };
    case Operator::LessEqual:
        return { "<=", kComparison };
    case Operator::Equal:
        return { "=", kComparison };
    case Operator::GreaterEqual:
        return { ">=", kComparison };
    case Operator::Greater:
        return { ">", kComparison };
    case Operator::NotEqual:
        return { "<>", kComparison };
    case Operator::UnaryPlus:
        return { "+", kUnary };
    case Operator::UnaryMinus:
        return { "-", kUnary };
    case Operator::Percent:
        return { "%", kPercent };
    }
    return { "?", kOperand };
}

// A number as written in a formula: in General form, unless rounding to 15 digits would push
// it past the largest number, in which case all its digits are kept.
std::string formulaNumberText(double value)
{
    std::string text = numberText(value);
    double parsed = 0.0;
    std::from_chars(text.data(), text.data() + text.size(), parsed);
    if (std::isfinite(parsed))
        return text;
    std::array<char, 40> buffer {};
    const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value);
    text.assign(buffer.data(), result.ptr);
    std::transform(text.begin(), text.end(), text.begin(), [](char c) { return c == 'e' ? 'E' : c; });
    return text;
}

std::string partText(char letter, const ReferencePart& part)
{
    std::string text(1, letter);
    if (!part.relative)
        text += std::to_string(part.value);
    else if (part.value != 0)
        text.append("[").append(std::to_string(part.value)).append("]");
    return text;
}

std::string referenceText(const CellReference& reference)
{
    return partText('R', reference.row) + partText('C', reference.column);
}

std::string quoted(const std::string& text)
{
    std::string result = "\"";
    for (char c : text) {
        result += c;
        if (c == '"')
            result += '"';
    }
    return result + "\"";
}

std::string wrapped(const Piece& piece, bool needsParentheses)
{
    return needsParentheses ? std::string("(").append(piece.text).append(")") : piece.text;
}

class Printer {
public:
    std::string print(const TokenArray& tokens)
    {
        for (const Token& token : tokens)
            std::visit([this](const auto& t) { add(t); }, token);
        if (m_stack.size() != 1)
            broken();
        return "=" + m_stack.back().text;
    }

private:
    [[noreturn]] static void broken()
    {
        throw xl::Error("The formula cannot be shown: its tokens do not form a complete formula.");
    }

    Piece pop()
    {
        if (m_stack.empty())
            broken();
        Piece piece = std::move(m_stack.back());
        m_stack.pop_back();
        return piece;
    }
    void push(std::string text, int precedence = kOperand) { m_stack.push_back({ std::move(text), precedence }); }

    void add(const NumberToken& t) { push(formulaNumberText(t.value)); }
    void add(const StringToken& t) { push(quoted(t.value)); }
    void add(const BooleanToken& t) { push(t.value ? "TRUE" : "FALSE"); }
    void add(const ErrorToken& t) { push(std::string(errorText(t.value))); }
    void add(const MissingArgumentToken&) { push(""); }
    void add(const ReferenceToken& t) { push(referenceText(t.cell)); }
    void add(const AreaToken& t) { push(referenceText(t.first) + ":" + referenceText(t.last)); }
    void add(const NameToken& t) { push(t.name); }
    void add(const ParenthesisToken&) { push(std::string("(").append(pop().text).append(")")); }

    void add(const OperatorToken& t)
    {
        const OperatorInfo info = operatorInfo(t.op);
        if (t.op == Operator::UnaryPlus || t.op == Operator::UnaryMinus) {
            const Piece operand = pop();
            push(std::string(info.symbol) + wrapped(operand, operand.precedence < kUnary), kUnary);
        } else if (t.op == Operator::Percent) {
            const Piece operand = pop();
            push(wrapped(operand, operand.precedence < kPercent) + "%", kPercent);
        } else {
            const Piece right = pop();
            const Piece left = pop();
            push(wrapped(left, left.precedence < info.precedence) + std::string(info.symbol)
                    + wrapped(right, right.precedence <= info.precedence),
                info.precedence);
        }
    }

    void add(const FunctionToken& t)
    {
        if (m_stack.size() < t.argumentCount)
            broken();
        const std::size_t first = m_stack.size() - t.argumentCount;
        std::string arguments;
        for (std::size_t i = first; i < m_stack.size(); ++i)
            arguments += (i > first ? "," : "") + m_stack[i].text;
        m_stack.resize(first);
        const FunctionInfo* info = t.functionIndex == kUnknownFunctionIndex ? nullptr : findFunction(t.functionIndex);
        const std::string name = info ? std::string(info->name) : t.name;
        if (name.empty())
            broken();
        push(name + "(" + arguments + ")");
    }

    std::vector<Piece> m_stack;
};

} // namespace

std::string formatFormulaR1C1(const TokenArray& tokens)
{
    return Printer().print(tokens);
}

} // namespace penmoor::engine
