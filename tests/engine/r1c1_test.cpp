#include "automation/contract/error.h"
#include "spreadsheet/formula/r1c1parser.h"
#include "spreadsheet/formula/r1c1printer.h"

#include <gtest/gtest.h>

namespace penmoor::engine {
namespace {

std::string roundTrip(const std::string& formula)
{
    return formatFormulaR1C1(parseFormulaR1C1(formula));
}

std::string parseError(const std::string& formula)
{
    try {
        parseFormulaR1C1(formula);
    } catch (const xl::Error& error) {
        return error.what();
    }
    return "accepted";
}

TEST(R1C1Formula, ReadsBackInTheApplicationsCanonicalForm)
{
    const std::pair<const char*, const char*> cases[] = {
        { "=R[-7]C[0]+R[-6]C[0]+R[-5]C[0]", "=R[-7]C+R[-6]C+R[-5]C" },
        { "=R[0]C[0]", "=RC" },
        { "=r[-2]c[12]", "=R[-2]C[12]" },
        { "=RC[-1]+1", "=RC[-1]+1" },
        { "=R5C3", "=R5C3" },
        { "=R[+1]C3", "=R[1]C3" },
        { "=DATE(YEAR(RC[-1]),MONTH(RC[-1])+1,1)", "=DATE(YEAR(RC[-1]),MONTH(RC[-1])+1,1)" },
        { "=sum(R1C1:R[-1]C, 2)", "=SUM(R1C1:R[-1]C,2)" },
        { "= 1 + 2 * 3", "=1+2*3" },
        { "=(1+2)*3", "=(1+2)*3" },
        { "=-2^2", "=-2^2" },
        { "=2^-2", "=2^-2" },
        { "=--1", "=--1" },
        { "=50%%", "=50%%" },
        { "=1-(2-3)", "=1-(2-3)" },
        { "=\"say \"\"hi\"\"\"&R1C1", "=\"say \"\"hi\"\"\"&R1C1" },
        { "=1<=2", "=1<=2" },
        { "=1<>2", "=1<>2" },
        { "=true", "=TRUE" },
        { "=TRUE()", "=TRUE()" },
        { "=#n/a", "=#N/A" },
        { "=IF(RC[-1],,1)", "=IF(RC[-1],,1)" },
        { "=1.5E+20", "=1.5E+20" },
        { "=.5", "=0.5" },
        { "=NoSuchFunction(1,2)", "=NoSuchFunction(1,2)" },
        { "=A1", "=A1" },
        { "=RC1x", "=RC1x" },
    };
    for (const auto& [entered, shown] : cases)
        EXPECT_EQ(roundTrip(entered), shown) << entered;
}

TEST(R1C1Formula, ProducesPostfixTokensForTheXlsFormat)
{
    // =R[-3]C[0]+R[-2]C[0]-R[-1]C[0] is ref, ref, add, ref, subtract.
    const TokenArray tokens = parseFormulaR1C1("=R[-3]C[0]+R[-2]C[0]-R[-1]C[0]");
    const auto ref = [](int rowOffset) { return Token(ReferenceToken { { { rowOffset, true }, { 0, true } } }); };
    EXPECT_EQ(tokens,
        (TokenArray {
            ref(-3), ref(-2), OperatorToken { Operator::Add }, ref(-1), OperatorToken { Operator::Subtract } }));

    const TokenArray call = parseFormulaR1C1("=DATE(YEAR(RC[-1]),1,R2C5)");
    ASSERT_EQ(call.size(), 5u);
    EXPECT_EQ(call[1], Token(FunctionToken { 69, 1, {} }));
    EXPECT_EQ(call[3], Token(ReferenceToken { { { 2, false }, { 5, false } } }));
    EXPECT_EQ(call[4], Token(FunctionToken { 65, 3, {} }));

    // Offsets stay as written even where they would leave the sheet from some cells.
    EXPECT_EQ(
        parseFormulaR1C1("=R[-65535]C[255]"), (TokenArray { ReferenceToken { { { -65535, true }, { 255, true } } } }));
}

TEST(R1C1Formula, RejectsMalformedFormulasNamingThemAndTheProblem)
{
    const std::pair<std::string, const char*> cases[] = {
        { "=", "has nothing after \"=\"" },
        { "1+1", "starts with \"=\"" },
        { "=1+", "ends too early" },
        { "=(1", "never closed" },
        { "=1)", "has no matching \"(\"" },
        { "=SUM(1", "never closed" },
        { "=1 2", "\"2\" at position 4 is unexpected" },
        { "=\"open", "no closing quote" },
        { "=R0C1", "the reference R0C1 is outside the sheet" },
        { "=R1C257", "outside the sheet" },
        { "=R65537C1", "outside the sheet" },
        { "=R[65536]C", "outside the sheet" },
        { "=RC[-256]", "outside the sheet" },
        { "=R99999999999999C1", "outside the sheet" },
        { "=DATE(1,2)", "DATE takes 3 arguments" },
        { "=YEAR()", "YEAR takes 1 argument" },
        { "=SUM()", "SUM takes 1 to 30 arguments" },
        { "=IF(1,2,3,4)", "IF takes 2 to 3 arguments" },
        { "=1E999", "too large" },
        { "=\"" + std::string(256, 'x') + "\"", "longer than 255 characters" },
        { "=" + std::string(200, '(') + "1" + std::string(200, ')'), "nested too deeply" },
        { "=" + std::string(9000, '1'), "longer than 8192 characters" },
        { "=R1C1:", "ends too early" },
        { "=R1C1:5", "must join two references" },
        { "={1,2}", "is unexpected" },
        { "=#WHAT", "is unexpected" },
        { "=1,2", "is unexpected" },
    };
    for (const auto& [formula, problem] : cases) {
        const std::string message = parseError(formula);
        EXPECT_EQ(message.rfind("The formula \"" + formula.substr(0, 120), 0), 0u) << message;
        EXPECT_NE(message.find(problem), std::string::npos) << formula << ": " << message;
    }
}

TEST(R1C1Formula, PrintsTokensFromFilesWithTheParenthesesTheyNeed)
{
    // (1+2)*3 without a parenthesis token, as another program may store it.
    const TokenArray tokens { NumberToken { 1 }, NumberToken { 2 }, OperatorToken { Operator::Add }, NumberToken { 3 },
        OperatorToken { Operator::Multiply } };
    EXPECT_EQ(formatFormulaR1C1(tokens), "=(1+2)*3");
    EXPECT_EQ(formatFormulaR1C1({ NumberToken { 1 }, NumberToken { 2 }, NumberToken { 3 },
                  OperatorToken { Operator::Subtract }, OperatorToken { Operator::Subtract } }),
        "=1-(2-3)");
    EXPECT_EQ(formatFormulaR1C1({ NumberToken { 1 }, NumberToken { 2 }, OperatorToken { Operator::Add },
                  OperatorToken { Operator::UnaryMinus } }),
        "=-(1+2)");
}

TEST(R1C1Formula, RefusesToPrintTokensThatFormNoFormula)
{
    for (const TokenArray& tokens : { TokenArray {}, TokenArray { OperatorToken { Operator::Add } },
             TokenArray { NumberToken { 1 }, NumberToken { 2 } }, TokenArray { FunctionToken { 4, 2, {} } } })
        EXPECT_THROW(formatFormulaR1C1(tokens), xl::Error);
}

} // namespace
} // namespace penmoor::engine
