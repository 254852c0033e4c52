#include "spreadsheet/xls/formulatokens.h"

#include "spreadsheet/formula/functiontable.h"
#include "spreadsheet/xls/biffstrings.h"
#include "spreadsheet/xls/bytebuffer.h"
#include "spreadsheet/xls/bytereader.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/unicode.h"

#include <array>
#include <cmath>

namespace penmoor::xls {

namespace {

using namespace engine;

// Token numbers (ptg). Operand tokens carry their class in bits 5-6: 0x20 reference,
// 0x40 value, 0x60 array; the base number is (ptg & 0x1F) | 0x20.
constexpr std::uint8_t kPtgExp = 0x01;
constexpr std::uint8_t kPtgParen = 0x15;
constexpr std::uint8_t kPtgMissArg = 0x16;
constexpr std::uint8_t kPtgStr = 0x17;
constexpr std::uint8_t kPtgAttr = 0x19;
constexpr std::uint8_t kPtgErr = 0x1C;
constexpr std::uint8_t kPtgBool = 0x1D;
constexpr std::uint8_t kPtgInt = 0x1E;
constexpr std::uint8_t kPtgNum = 0x1F;
constexpr std::uint8_t kPtgFunc = 0x21;
constexpr std::uint8_t kPtgFuncVar = 0x22;
constexpr std::uint8_t kPtgRef = 0x24;
constexpr std::uint8_t kPtgArea = 0x25;
constexpr std::uint8_t kPtgRefErr = 0x2A;
constexpr std::uint8_t kPtgAreaErr = 0x2B;
constexpr std::uint8_t kPtgRefN = 0x2C;
constexpr std::uint8_t kPtgAreaN = 0x2D;

constexpr std::uint8_t kClassReference = 0x20;
constexpr std::uint8_t kClassValue = 0x40;

constexpr std::uint16_t kRowRelative = 0x8000;
constexpr std::uint16_t kColumnRelative = 0x4000;
constexpr std::uint16_t kColumnMask = 0x00FF;

// ptgAttr options.
constexpr std::uint8_t kAttrVolatile = 0x01;
constexpr std::uint8_t kAttrIf = 0x02;
constexpr std::uint8_t kAttrChoose = 0x04;
constexpr std::uint8_t kAttrGoto = 0x08;
constexpr std::uint8_t kAttrSum = 0x10;
constexpr std::uint8_t kAttrSpace = 0x40;
constexpr std::uint16_t kSumFunction = 4;

constexpr std::size_t kMaxFormulaText = 255;

// Operators by token number, 0x03 (add) to 0x14 (percent); 0x0F-0x11 are the reference
// operators, which the model does not have.
struct OperatorCode {
    Operator op;
    std::uint8_t ptg;
};
constexpr std::array kOperators {
    OperatorCode { Operator::Add, 0x03 },
    OperatorCode { Operator::Subtract, 0x04 },
    OperatorCode { Operator::Multiply, 0x05 },
    OperatorCode { Operator::Divide, 0x06 },
    OperatorCode { Operator::Power, 0x07 },
    OperatorCode { Operator::Concatenate, 0x08 },
    OperatorCode { Operator::Less, 0x09 },
    OperatorCode { Operator::LessEqual, 0x0A },
    OperatorCode { Operator::Equal, 0x0B },
    OperatorCode { Operator::GreaterEqual, 0x0C },
    OperatorCode { Operator::Greater, 0x0D },
    OperatorCode { Operator::NotEqual, 0x0E },
    OperatorCode { Operator::UnaryPlus, 0x12 },
    OperatorCode { Operator::UnaryMinus, 0x13 },
    OperatorCode { Operator::Percent, 0x14 },
};

bool isUnary(Operator op)
{
    return op == Operator::UnaryPlus || op == Operator::UnaryMinus || op == Operator::Percent;
}

std::string cellName(CellPosition cell)
{
    return columnLetters(cell.column) + std::to_string(cell.row);
}

struct FileReference {
    bool onSheet = true;
    std::uint16_t row = 0;
    std::uint16_t column = 0; // with the relative bits
};

FileReference resolve(const CellReference& reference, CellPosition cell)
{
    const int row = reference.row.resolve(cell.row);
    const int column = reference.column.resolve(cell.column);
    if (row < 1 || row > kMaxRows || column < 1 || column > kMaxColumns)
        return { false, 0, 0 };
    return { true, static_cast<std::uint16_t>(row - 1),
        static_cast<std::uint16_t>((column - 1) | (reference.row.relative ? kRowRelative : 0)
            | (reference.column.relative ? kColumnRelative : 0)) };
}

class Encoder {
public:
    Encoder(CellPosition cell, ByteBuffer& out)
        : m_cell(cell)
        , m_out(out)
    {
    }

    // False when the token cannot be written.
    bool write(const Token& token, bool byReference)
    {
        const std::uint8_t operandClass = byReference ? kClassReference : kClassValue;
        return std::visit([&](const auto& t) { return put(t, operandClass); }, token);
    }

private:
    bool put(const NumberToken& t, std::uint8_t)
    {
        if (t.value >= 0 && t.value <= 65535 && t.value == std::floor(t.value) && !std::signbit(t.value)) {
            m_out.u8(kPtgInt);
            m_out.u16(static_cast<std::uint16_t>(t.value));
        } else {
            m_out.u8(kPtgNum);
            m_out.f64(t.value);
        }
        return true;
    }
    bool put(const StringToken& t, std::uint8_t)
    {
        const std::u16string text = utf8ToUtf16(t.value);
        if (text.size() > kMaxFormulaText)
            throw WriteError("a text in the formula in " + cellName(m_cell) + " is longer than 255 characters");
        m_out.u8(kPtgStr);
        writeShortString(m_out, text);
        return true;
    }
    bool put(const BooleanToken& t, std::uint8_t)
    {
        m_out.u8(kPtgBool);
        m_out.u8(t.value ? 1 : 0);
        return true;
    }
    bool put(const ErrorToken& t, std::uint8_t)
    {
        m_out.u8(kPtgErr);
        m_out.u8(static_cast<std::uint8_t>(t.value));
        return true;
    }
    bool put(const MissingArgumentToken&, std::uint8_t)
    {
        m_out.u8(kPtgMissArg);
        return true;
    }
    bool put(const ReferenceToken& t, std::uint8_t operandClass)
    {
        const FileReference target = resolve(t.cell, m_cell);
        if (!target.onSheet) {
            m_out.u8(static_cast<std::uint8_t>((kPtgRefErr & 0x1F) | operandClass));
            m_out.zeros(4);
            return true;
        }
        m_out.u8(static_cast<std::uint8_t>((kPtgRef & 0x1F) | operandClass));
        m_out.u16(target.row);
        m_out.u16(target.column);
        return true;
    }
    bool put(const AreaToken& t, std::uint8_t operandClass)
    {
        const FileReference first = resolve(t.first, m_cell);
        const FileReference last = resolve(t.last, m_cell);
        if (!first.onSheet || !last.onSheet) {
            m_out.u8(static_cast<std::uint8_t>((kPtgAreaErr & 0x1F) | operandClass));
            m_out.zeros(8);
            return true;
        }
        m_out.u8(static_cast<std::uint8_t>((kPtgArea & 0x1F) | operandClass));
        m_out.u16(first.row);
        m_out.u16(last.row);
        m_out.u16(first.column);
        m_out.u16(last.column);
        return true;
    }
    bool put(const OperatorToken& t, std::uint8_t)
    {
        for (const OperatorCode& code : kOperators) {
            if (code.op == t.op) {
                m_out.u8(code.ptg);
                return true;
            }
        }
        return false;
    }
    bool put(const ParenthesisToken&, std::uint8_t)
    {
        m_out.u8(kPtgParen);
        return true;
    }
    bool put(const FunctionToken& t, std::uint8_t)
    {
        const FunctionInfo* info = findFunction(t.functionIndex);
        if (!info || t.functionIndex == kUnknownFunctionIndex)
            return false;
        if (t.argumentCount < info->minArguments || t.argumentCount > info->maxArguments)
            throw WriteError("the formula in " + cellName(m_cell) + " calls " + std::string(info->name)
                + " with a wrong number of arguments");
        if (info->hasFixedArgumentCount()) {
            m_out.u8(static_cast<std::uint8_t>((kPtgFunc & 0x1F) | kClassValue));
        } else {
            m_out.u8(static_cast<std::uint8_t>((kPtgFuncVar & 0x1F) | kClassValue));
            m_out.u8(t.argumentCount);
        }
        m_out.u16(t.functionIndex);
        return true;
    }
    bool put(const NameToken&, std::uint8_t) { return false; }

    CellPosition m_cell;
    ByteBuffer& m_out;
};

class Decoder {
public:
    Decoder(std::span<const std::uint8_t> bytes, CellPosition cell)
        : m_in(bytes, "a formula")
        , m_cell(cell)
    {
    }

    std::optional<TokenArray> run()
    {
        TokenArray tokens;
        while (m_in.remaining() > 0) {
            if (!next(tokens))
                return std::nullopt;
        }
        return tokens;
    }

private:
    bool next(TokenArray& tokens)
    {
        const std::uint8_t ptg = m_in.u8();
        for (const OperatorCode& code : kOperators) {
            if (code.ptg == ptg) {
                tokens.push_back(OperatorToken { code.op });
                return true;
            }
        }
        switch (ptg) {
        case kPtgParen:
            tokens.push_back(ParenthesisToken {});
            return true;
        case kPtgMissArg:
            tokens.push_back(MissingArgumentToken {});
            return true;
        case kPtgStr:
            tokens.push_back(StringToken { utf16ToUtf8(readShortString(m_in)) });
            return true;
        case kPtgErr:
            tokens.push_back(ErrorToken { static_cast<xl::ErrorValue>(m_in.u8()) });
            return true;
        case kPtgBool:
            tokens.push_back(BooleanToken { m_in.u8() != 0 });
            return true;
        case kPtgInt:
            tokens.push_back(NumberToken { static_cast<double>(m_in.u16()) });
            return true;
        case kPtgNum:
            tokens.push_back(NumberToken { m_in.f64() });
            return true;
        case kPtgAttr:
            return attribute(tokens);
        case kPtgExp:
            return false;
        default:
            break;
        }
        if (ptg < 0x20 || ptg > 0x7F)
            return false;
        return operand(static_cast<std::uint8_t>((ptg & 0x1F) | 0x20), tokens);
    }

    // ptgAttr: only a one-argument SUM carries meaning; the rest are jumps and spacing that
    // the postfix order already makes redundant.
    bool attribute(TokenArray& tokens)
    {
        const std::uint8_t options = m_in.u8();
        const std::uint16_t data = m_in.u16();
        if (options & kAttrSum) {
            tokens.push_back(FunctionToken { kSumFunction, 1, {} });
            return true;
        }
        if (options & kAttrChoose) {
            m_in.skip(2 * (std::size_t { data } + 1));
            return true;
        }
        return (options & (kAttrVolatile | kAttrIf | kAttrGoto | kAttrSpace)) != 0 || options == 0;
    }

    bool operand(std::uint8_t base, TokenArray& tokens)
    {
        switch (base) {
        case kPtgFunc: {
            const FunctionInfo* info = findFunction(m_in.u16());
            if (!info || !info->hasFixedArgumentCount())
                return false;
            tokens.push_back(FunctionToken { info->index, info->minArguments, {} });
            return true;
        }
        case kPtgFuncVar: {
            const std::uint8_t count = m_in.u8() & 0x7F;
            const FunctionInfo* info = findFunction(static_cast<std::uint16_t>(m_in.u16() & 0x7FFF));
            if (!info || count < info->minArguments || count > info->maxArguments)
                return false;
            tokens.push_back(FunctionToken { info->index, count, {} });
            return true;
        }
        case kPtgRef:
        case kPtgRefN: {
            const std::uint16_t row = m_in.u16();
            const std::uint16_t column = m_in.u16();
            tokens.push_back(ReferenceToken { reference(row, column, base == kPtgRefN) });
            return true;
        }
        case kPtgArea:
        case kPtgAreaN: {
            const std::uint16_t firstRow = m_in.u16();
            const std::uint16_t lastRow = m_in.u16();
            const std::uint16_t firstColumn = m_in.u16();
            const std::uint16_t lastColumn = m_in.u16();
            const bool offsets = base == kPtgAreaN;
            tokens.push_back(
                AreaToken { reference(firstRow, firstColumn, offsets), reference(lastRow, lastColumn, offsets) });
            return true;
        }
        case kPtgRefErr:
            m_in.skip(4);
            tokens.push_back(ErrorToken { xl::ErrorValue::Ref });
            return true;
        case kPtgAreaErr:
            m_in.skip(8);
            tokens.push_back(ErrorToken { xl::ErrorValue::Ref });
            return true;
        default:
            return false;
        }
    }

    CellReference reference(std::uint16_t row, std::uint16_t column, bool offsets) const
    {
        const bool rowRelative = (column & kRowRelative) != 0;
        const bool columnRelative = (column & kColumnRelative) != 0;
        const int columnIndex = column & kColumnMask;
        CellReference result;
        if (!rowRelative)
            result.row = { row + 1, false };
        else if (offsets)
            result.row = { static_cast<std::int16_t>(row), true };
        else
            result.row = { row + 1 - m_cell.row, true };
        if (!columnRelative)
            result.column = { columnIndex + 1, false };
        else if (offsets)
            result.column = { static_cast<std::int8_t>(columnIndex), true };
        else
            result.column = { columnIndex + 1 - m_cell.column, true };
        return result;
    }

    ByteReader m_in;
    CellPosition m_cell;
};

} // namespace

// Marks which reference tokens feed a parameter that takes references, by replaying the
// postfix array on a stack of the tokens that produced each operand.
void FormulaEncoder::markReferenceOperands(const TokenArray& tokens, CellPosition cell)
{
    constexpr std::size_t kComputed = static_cast<std::size_t>(-1);
    m_byReference.assign(tokens.size(), false);
    m_roots.clear();
    auto pop = [&]() {
        if (m_roots.empty())
            throw WriteError("the formula in " + cellName(cell) + " is malformed");
        const std::size_t root = m_roots.back();
        m_roots.pop_back();
        return root;
    };
    for (std::size_t i = 0; i < tokens.size(); ++i) {
        const Token& token = tokens[i];
        if (const auto* op = std::get_if<OperatorToken>(&token)) {
            pop();
            if (!isUnary(op->op))
                pop();
            m_roots.push_back(kComputed);
        } else if (std::holds_alternative<ParenthesisToken>(token)) {
            m_roots.push_back(pop());
        } else if (const auto* call = std::get_if<FunctionToken>(&token)) {
            const FunctionInfo* info = findFunction(call->functionIndex);
            for (int argument = call->argumentCount - 1; argument >= 0; --argument) {
                const std::size_t root = pop();
                if (info && root != kComputed && info->parameterClass(argument) == ParameterClass::Reference)
                    m_byReference[root] = true;
            }
            m_roots.push_back(kComputed);
        } else if (std::holds_alternative<ReferenceToken>(token) || std::holds_alternative<AreaToken>(token)) {
            m_roots.push_back(i);
        } else {
            m_roots.push_back(kComputed);
        }
    }
    if (m_roots.size() != 1 && !tokens.empty())
        throw WriteError("the formula in " + cellName(cell) + " is malformed");
}

bool FormulaEncoder::encode(const TokenArray& tokens, CellPosition cell, ByteBuffer& out)
{
    markReferenceOperands(tokens, cell);
    const std::size_t start = out.size();
    Encoder encoder(cell, out);
    for (std::size_t i = 0; i < tokens.size(); ++i) {
        if (!encoder.write(tokens[i], m_byReference[i])) {
            out.truncate(start);
            return false;
        }
    }
    return true;
}

std::optional<std::vector<std::uint8_t>> encodeFormula(const TokenArray& tokens, CellPosition cell)
{
    ByteBuffer out;
    if (!FormulaEncoder().encode(tokens, cell, out))
        return std::nullopt;
    return out.take();
}

std::optional<TokenArray> decodeFormula(std::span<const std::uint8_t> bytes, CellPosition cell)
{
    return Decoder(bytes, cell).run();
}

} // namespace penmoor::xls
