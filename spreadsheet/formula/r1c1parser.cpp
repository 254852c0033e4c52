#include "spreadsheet/formula/r1c1parser.h"

#include "automation/contract/error.h"
#include "spreadsheet/formula/functiontable.h"
#include "spreadsheet/formula/valuetext.h"
#include "spreadsheet/workbook/address.h"
#include "spreadsheet/workbook/text.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <optional>
#include <span>
#include <string>

namespace penmoor::engine {

namespace {

constexpr int kMaxNesting = 100;
constexpr int kMaxArguments = 30;
constexpr long long kSaturated = 10'000'000'000; // beyond any row or column

bool isDigit(char c)
{
    return c >= '0' && c <= '9';
}
bool isLetter(char c)
{
    return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
}
bool isNameCharacter(char c)
{
    return isLetter(c) || isDigit(c) || c == '_' || c == '.' || c == '\\' || static_cast<unsigned char>(c) >= 0x80;
}
struct ParseFailure {
    std::string reason;
};

class Parser {
public:
    explicit Parser(std::string_view text)
        : m_text(text)
    {
    }

    TokenArray parse()
    {
        m_position = 1; // after "="
        skipBlanks();
        if (atEnd())
            fail("it has nothing after \"=\"");
        parseExpression();
        skipBlanks();
        if (!atEnd()) {
            if (peek() == ')')
                fail("\")\" at position " + std::to_string(m_position + 1) + " has no matching \"(\"");
            unexpected();
        }
        return std::move(m_tokens);
    }

private:
    bool atEnd() const { return m_position >= m_text.size(); }
    char peek(std::size_t ahead = 0) const
    {
        return m_position + ahead < m_text.size() ? m_text[m_position + ahead] : '\0';
    }
    void skipBlanks()
    {
        while (!atEnd() && (peek() == ' ' || peek() == '\n' || peek() == '\r'))
            ++m_position;
    }
    // Consumes `symbol` (after blanks) when it comes next.
    bool accept(std::string_view symbol)
    {
        skipBlanks();
        if (m_text.substr(m_position, symbol.size()) != symbol)
            return false;
        m_position += symbol.size();
        return true;
    }

    [[noreturn]] void fail(std::string reason) const { throw ParseFailure { std::move(reason) }; }
    [[noreturn]] void unexpected() const
    {
        if (atEnd())
            fail("it ends too early");
        fail("\"" + std::string(1, peek()) + "\" at position " + std::to_string(m_position + 1) + " is unexpected");
    }

    template <class T> void emit(T token) { m_tokens.emplace_back(std::in_place_type<T>, std::move(token)); }
    void emitOperator(Operator op) { emit(OperatorToken { op }); }

    void enter()
    {
        if (++m_depth > kMaxNesting)
            fail("it is nested too deeply");
    }
    void leave() { --m_depth; }

    // Binary operators by precedence, loosest first; at each level the longer symbols come first.
    struct BinaryOperator {
        std::string_view symbol;
        Operator op;
    };
    static constexpr std::array<std::span<const BinaryOperator>, 5> levels()
    {
        return { kComparisons, kConcatenation, kAdditive, kMultiplicative, kPower };
    }
    static constexpr BinaryOperator kComparisons[] = { { "<=", Operator::LessEqual }, { ">=", Operator::GreaterEqual },
        { "<>", Operator::NotEqual }, { "<", Operator::Less }, { ">", Operator::Greater }, { "=", Operator::Equal } };
    static constexpr BinaryOperator kConcatenation[] = { { "&", Operator::Concatenate } };
    static constexpr BinaryOperator kAdditive[] = { { "+", Operator::Add }, { "-", Operator::Subtract } };
    static constexpr BinaryOperator kMultiplicative[] = { { "*", Operator::Multiply }, { "/", Operator::Divide } };
    static constexpr BinaryOperator kPower[] = { { "^", Operator::Power } };

    void parseExpression() { parseLevel(0); }

    // Operands of one precedence level joined by its operators, left to right.
    void parseLevel(std::size_t level)
    {
        if (level == levels().size()) {
            parsePercent();
            return;
        }
        parseLevel(level + 1);
        while (true) {
            const std::span<const BinaryOperator> operators = levels()[level];
            const auto found = std::find_if(operators.begin(), operators.end(),
                [&](const BinaryOperator& candidate) { return accept(candidate.symbol); });
            if (found == operators.end())
                return;
            parseLevel(level + 1);
            emitOperator(found->op);
        }
    }

    // Negation binds tighter than %, which binds tighter than ^: -2^2 is 4.
    void parsePercent()
    {
        std::string signs;
        while (true) {
            if (accept("-"))
                signs += '-';
            else if (accept("+"))
                signs += '+';
            else
                break;
        }
        parsePrimary();
        for (auto sign = signs.rbegin(); sign != signs.rend(); ++sign)
            emitOperator(*sign == '-' ? Operator::UnaryMinus : Operator::UnaryPlus);
        while (accept("%"))
            emitOperator(Operator::Percent);
    }

    void parsePrimary()
    {
        skipBlanks();
        if (atEnd())
            unexpected();
        const char c = peek();
        if (c == '(') {
            ++m_position;
            enter();
            parseExpression();
            if (!accept(")"))
                atEnd() ? fail("a \"(\" is never closed") : unexpected();
            leave();
            emit(ParenthesisToken {});
        } else if (isDigit(c) || (c == '.' && isDigit(peek(1)))) {
            parseNumber();
        } else if (c == '"') {
            parseString();
        } else if (c == '#') {
            parseError();
        } else if (isNameCharacter(c) && !isDigit(c) && c != '.') {
            parseNameOrReference();
        } else {
            unexpected();
        }
    }

    void parseNumber()
    {
        const std::size_t start = m_position;
        while (isDigit(peek()))
            ++m_position;
        if (peek() == '.') {
            ++m_position;
            while (isDigit(peek()))
                ++m_position;
        }
        if ((peek() == 'e' || peek() == 'E')
            && (isDigit(peek(1)) || ((peek(1) == '+' || peek(1) == '-') && isDigit(peek(2))))) {
            m_position += 2;
            while (isDigit(peek()))
                ++m_position;
        }
        const std::string_view text = m_text.substr(start, m_position - start);
        double value = 0.0;
        const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
        if (error != std::errc() || end != text.data() + text.size() || !std::isfinite(value))
            fail("the number " + std::string(text) + " is too large");
        emit(NumberToken { value });
    }

    void parseString()
    {
        ++m_position; // the opening quote
        std::string value;
        while (true) {
            if (atEnd())
                fail("a text constant has no closing quote");
            const char c = m_text[m_position++];
            if (c == '"') {
                if (peek() != '"')
                    break;
                ++m_position;
            }
            value += c;
        }
        if (characterCount(value) > kMaxFormulaStringLength)
            fail("a text constant is longer than 255 characters");
        emit(StringToken { std::move(value) });
    }

    void parseError()
    {
        for (std::size_t length = 7; length >= 4; --length) {
            const std::string_view candidate = m_text.substr(m_position, length);
            if (candidate.size() != length)
                continue;
            if (const std::optional<xl::ErrorValue> error = parseErrorText(candidate)) {
                m_position += length;
                emit(ErrorToken { *error });
                return;
            }
        }
        unexpected();
    }

    // One coordinate of a reference after its R or C: [n], [-n], n, or nothing (offset 0).
    // Nothing when the text there is not one.
    std::optional<ReferencePart> parseReferencePart(std::size_t& at, int maxIndex) const
    {
        const auto digitsAt = [&](std::size_t from, long long& value) {
            std::size_t end = from;
            value = 0;
            while (end < m_text.size() && isDigit(m_text[end]))
                value = std::min(value * 10 + (m_text[end++] - '0'), kSaturated);
            return end;
        };
        long long value = 0;
        if (at < m_text.size() && m_text[at] == '[') {
            std::size_t from = at + 1;
            const bool negative = from < m_text.size() && m_text[from] == '-';
            if (from < m_text.size() && (m_text[from] == '-' || m_text[from] == '+'))
                ++from;
            const std::size_t end = digitsAt(from, value);
            if (end == from || end >= m_text.size() || m_text[end] != ']')
                return std::nullopt;
            at = end + 1;
            if (value > maxIndex - 1)
                return ReferencePart { maxIndex, true }; // flagged as outside by the caller
            return ReferencePart { static_cast<int>(negative ? -value : value), true };
        }
        const std::size_t end = digitsAt(at, value);
        if (end == at)
            return ReferencePart { 0, true };
        at = end;
        return ReferencePart { value > maxIndex ? 0 : static_cast<int>(value), false };
    }

    static bool partOnSheet(const ReferencePart& part, int maxIndex)
    {
        return part.relative ? part.value > -maxIndex && part.value < maxIndex
                             : part.value >= 1 && part.value <= maxIndex;
    }

    // A reference such as R[-1]C or R5C3 at the current position, when one is there and is
    // not just the beginning of a longer name or a function.
    std::optional<CellReference> tryReference()
    {
        std::size_t at = m_position;
        if (toAsciiUpper(peek()) != 'R')
            return std::nullopt;
        ++at;
        const std::optional<ReferencePart> row = parseReferencePart(at, kMaxRows);
        if (!row || at >= m_text.size() || toAsciiUpper(m_text[at]) != 'C')
            return std::nullopt;
        ++at;
        const std::optional<ReferencePart> column = parseReferencePart(at, kMaxColumns);
        if (!column || (at < m_text.size() && (isNameCharacter(m_text[at]) || m_text[at] == '(')))
            return std::nullopt;
        const std::string_view text = m_text.substr(m_position, at - m_position);
        if (!partOnSheet(*row, kMaxRows) || !partOnSheet(*column, kMaxColumns))
            fail("the reference " + std::string(text) + " is outside the sheet");
        m_position = at;
        return CellReference { *row, *column };
    }

    void parseNameOrReference()
    {
        if (const std::optional<CellReference> first = tryReference()) {
            skipBlanks();
            if (peek() != ':') {
                emit(ReferenceToken { *first });
                return;
            }
            ++m_position;
            skipBlanks();
            const std::optional<CellReference> last = tryReference();
            if (!last)
                atEnd() ? fail("it ends too early") : fail("\":\" must join two references");
            emit(AreaToken { *first, *last });
            return;
        }

        const std::size_t start = m_position;
        while (isNameCharacter(peek()))
            ++m_position;
        const std::string name(m_text.substr(start, m_position - start));
        skipBlanks();
        if (peek() == '(') {
            ++m_position;
            parseCall(name);
            return;
        }
        if (equalsIgnoringCase(name, "TRUE") || equalsIgnoringCase(name, "FALSE"))
            emit(BooleanToken { equalsIgnoringCase(name, "TRUE") });
        else
            emit(NameToken { name });
    }

    void parseCall(const std::string& name)
    {
        enter();
        int count = 0;
        if (!accept(")")) {
            while (true) {
                skipBlanks();
                if (peek() == ',' || peek() == ')')
                    emit(MissingArgumentToken {});
                else
                    parseExpression();
                ++count;
                if (accept(","))
                    continue;
                if (accept(")"))
                    break;
                atEnd() ? fail("the call of " + name + " is never closed") : unexpected();
            }
        }
        leave();

        const FunctionInfo* info = findFunction(name);
        const int minimum = info ? info->minArguments : 0;
        const int maximum = info ? info->maxArguments : kMaxArguments;
        if (count < minimum || count > maximum) {
            const std::string shown = info ? std::string(info->name) : name;
            if (minimum == maximum)
                fail(shown + " takes " + std::to_string(minimum) + (minimum == 1 ? " argument" : " arguments"));
            fail(shown + " takes " + std::to_string(minimum) + " to " + std::to_string(maximum) + " arguments");
        }
        if (info)
            emit(FunctionToken { info->index, static_cast<std::uint8_t>(count), {} });
        else
            emit(FunctionToken { kUnknownFunctionIndex, static_cast<std::uint8_t>(count), name });
    }

    std::string_view m_text;
    std::size_t m_position = 0;
    int m_depth = 0;
    TokenArray m_tokens;
};

std::string shownFormula(std::string_view formula)
{
    constexpr std::size_t kShown = 120;
    if (formula.size() <= kShown)
        return std::string(formula);
    return std::string(formula.substr(0, kShown)) + "...";
}

} // namespace

TokenArray parseFormulaR1C1(std::string_view formula)
{
    const auto invalid = [&](const std::string& reason) {
        return xl::Error("The formula \"" + shownFormula(formula) + "\" is not valid: " + reason + ".");
    };
    if (formula.empty() || formula.front() != '=')
        throw invalid("a formula starts with \"=\"");
    if (formula.size() > kMaxFormulaLength)
        throw invalid("it is longer than 8192 characters");
    try {
        return Parser(formula).parse();
    } catch (const ParseFailure& failure) {
        throw invalid(failure.reason);
    }
}

} // namespace penmoor::engine
