#include "spreadsheet/picture/numberformat.h"

#include "spreadsheet/picture/decimaldigits.h"
#include "spreadsheet/picture/generalnumber.h"
#include "spreadsheet/picture/serialdate.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <optional>

namespace penmoor::picture {

namespace {

enum class TokenKind {
    Literal,
    Digit, // 0 # ?
    DecimalPoint,
    Comma, // thousands separator or scaling, resolved after parsing
    Percent,
    Exponent, // E+ E- e+ e-
    TextValue, // @
    General,
    Fill, // *x
    Year2,
    Year4,
    Month, // m or mm until resolved, then Month or Minute
    MonthAbbreviation,
    MonthName,
    MonthLetter,
    Day,
    DayAbbreviation,
    DayName,
    Hour,
    Minute,
    Second,
    ElapsedHours,
    ElapsedMinutes,
    ElapsedSeconds,
    Subsecond,
    AmPm,
};

struct Token {
    TokenKind kind = TokenKind::Literal;
    std::string text; // literal text, placeholder character, fill character, exponent "E+"
    int width = 1; // digits of m/mm, d/dd, h/hh, s/ss, [hh], subsecond digits
    std::string am; // AM/PM forms
    std::string pm;
};

Token makeToken(TokenKind kind, std::string text = {}, int width = 1)
{
    Token token;
    token.kind = kind;
    token.text = std::move(text);
    token.width = width;
    return token;
}

ShownForm plainForm(std::string text)
{
    ShownForm form;
    form.text = std::move(text);
    return form;
}

enum class Comparison { Less, LessEqual, Greater, GreaterEqual, Equal, NotEqual };

struct Condition {
    Comparison comparison;
    double operand;

    bool matches(double value) const
    {
        switch (comparison) {
        case Comparison::Less:
            return value < operand;
        case Comparison::LessEqual:
            return value <= operand;
        case Comparison::Greater:
            return value > operand;
        case Comparison::GreaterEqual:
            return value >= operand;
        case Comparison::Equal:
            return value == operand;
        case Comparison::NotEqual:
            return value != operand;
        }
        return false;
    }
};

bool equalsIgnoringCase(std::string_view a, std::string_view b)
{
    return a.size() == b.size() && std::equal(a.begin(), a.end(), b.begin(), [](char x, char y) {
        return (x >= 'A' && x <= 'Z' ? x - 'A' + 'a' : x) == (y >= 'A' && y <= 'Z' ? y - 'A' + 'a' : y);
    });
}

bool startsWithIgnoringCase(std::string_view text, std::size_t at, std::string_view prefix)
{
    return text.size() - at >= prefix.size() && equalsIgnoringCase(text.substr(at, prefix.size()), prefix);
}

char lower(char c)
{
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

// Length of the UTF-8 character that starts at text[at].
std::size_t characterLength(std::string_view text, std::size_t at)
{
    const auto lead = static_cast<unsigned char>(text[at]);
    std::size_t length = lead < 0x80 ? 1 : lead >= 0xF0 ? 4 : lead >= 0xE0 ? 3 : lead >= 0xC0 ? 2 : 1;
    return std::min(length, text.size() - at);
}

std::optional<double> parseNumber(std::string_view text)
{
    double value = 0;
    const auto [end, ec] = std::from_chars(text.data(), text.data() + text.size(), value);
    if (ec != std::errc() || end != text.data() + text.size()) {
        return std::nullopt;
    }
    return value;
}

std::optional<FormatColor> namedColor(std::string_view name)
{
    struct Named {
        std::string_view name;
        std::uint32_t rgb;
    };
    static constexpr std::array<Named, 8> kColors { {
        { "black", 0x000000 },
        { "blue", 0x0000FF },
        { "cyan", 0x00FFFF },
        { "green", 0x00FF00 },
        { "magenta", 0xFF00FF },
        { "red", 0xFF0000 },
        { "white", 0xFFFFFF },
        { "yellow", 0xFFFF00 },
    } };
    for (const Named& color : kColors) {
        if (equalsIgnoringCase(name, color.name)) {
            return FormatColor { FormatColor::Kind::Rgb, color.rgb };
        }
    }
    if (startsWithIgnoringCase(name, 0, "color")) {
        int index = 0;
        const std::string_view digits = name.substr(5);
        const auto [end, ec] = std::from_chars(digits.data(), digits.data() + digits.size(), index);
        if (ec == std::errc() && end == digits.data() + digits.size() && index >= 1 && index <= 56) {
            return FormatColor { FormatColor::Kind::Palette, static_cast<std::uint32_t>(index) };
        }
    }
    return std::nullopt;
}

std::optional<Condition> parseCondition(std::string_view text)
{
    struct Operator {
        std::string_view symbol;
        Comparison comparison;
    };
    static constexpr std::array<Operator, 6> kOperators { {
        { "<=", Comparison::LessEqual },
        { ">=", Comparison::GreaterEqual },
        { "<>", Comparison::NotEqual },
        { "<", Comparison::Less },
        { ">", Comparison::Greater },
        { "=", Comparison::Equal },
    } };
    for (const Operator& op : kOperators) {
        if (text.starts_with(op.symbol)) {
            if (auto operand = parseNumber(text.substr(op.symbol.size()))) {
                return Condition { op.comparison, *operand };
            }
            return std::nullopt;
        }
    }
    return std::nullopt;
}

const std::array<std::string_view, 12> kMonthNames { "January", "February", "March", "April", "May", "June", "July",
    "August", "September", "October", "November", "December" };
const std::array<std::string_view, 7> kDayNames { "Sunday", "Monday", "Tuesday", "Wednesday", "Thursday", "Friday",
    "Saturday" };

} // namespace

struct NumberFormat::Section {
    std::vector<Token> tokens;
    FormatColor color;
    std::optional<Condition> condition;
    bool isDateTime = false;
    bool hasAmPm = false;
    bool hasText = false;
    bool hasGeneral = false;
    bool hasDigits = false;
    bool hasExponent = false;
    bool groupThousands = false;
    int percentCount = 0;
    int scaleCommas = 0;
    int subsecondDigits = 0;

    static Section parse(std::string_view code);
    void resolve();
    std::vector<ShownForm> showNumber(double value, bool withSign) const;
    std::vector<ShownForm> showDateTime(double serial) const;
    ShownForm showText(const std::string& text) const;

private:
    std::string formatDigits(double value, bool withSign, std::size_t& fillOffset) const;
    void appendDateTime(std::string& out, const Token& token, const DateTimeParts& parts) const;
    std::vector<ShownForm> assemble(const std::vector<std::string>& replacements, TokenKind replaced) const;
};

NumberFormat::Section NumberFormat::Section::parse(std::string_view code)
{
    Section section;
    auto literal = [&section](std::string_view text) {
        if (!section.tokens.empty() && section.tokens.back().kind == TokenKind::Literal) {
            section.tokens.back().text += text;
        } else {
            section.tokens.push_back(makeToken(TokenKind::Literal, std::string(text)));
        }
    };
    auto runLength = [&code](std::size_t at) {
        std::size_t end = at;
        while (end < code.size() && lower(code[end]) == lower(code[at])) {
            ++end;
        }
        return static_cast<int>(end - at);
    };

    std::size_t i = 0;
    while (i < code.size()) {
        const char c = code[i];
        const char lc = lower(c);
        if (c == '"') {
            const std::size_t close = code.find('"', i + 1);
            const std::size_t end = close == std::string_view::npos ? code.size() : close;
            literal(code.substr(i + 1, end - i - 1));
            i = end + 1;
        } else if (c == '\\' && i + 1 < code.size()) {
            const std::size_t length = characterLength(code, i + 1);
            literal(code.substr(i + 1, length));
            i += 1 + length;
        } else if (c == '_' && i + 1 < code.size()) {
            literal(" "); // room for the character that follows, as wide as a space here
            i += 1 + characterLength(code, i + 1);
        } else if (c == '*' && i + 1 < code.size()) {
            const std::size_t length = characterLength(code, i + 1);
            section.tokens.push_back(makeToken(TokenKind::Fill, std::string(code.substr(i + 1, length))));
            i += 1 + length;
        } else if (c == '[') {
            const std::size_t close = code.find(']', i + 1);
            if (close == std::string_view::npos) {
                literal(code.substr(i));
                break;
            }
            const std::string_view inside = code.substr(i + 1, close - i - 1);
            i = close + 1;
            const char first = inside.empty() ? '\0' : lower(inside.front());
            const bool elapsed = !inside.empty() && (first == 'h' || first == 'm' || first == 's')
                && std::all_of(inside.begin(), inside.end(), [first](char x) { return lower(x) == first; });
            if (elapsed) {
                const TokenKind kind = first == 'h' ? TokenKind::ElapsedHours
                    : first == 'm'                  ? TokenKind::ElapsedMinutes
                                                    : TokenKind::ElapsedSeconds;
                section.tokens.push_back(makeToken(kind, {}, static_cast<int>(inside.size())));
            } else if (auto color = namedColor(inside)) {
                section.color = *color;
            } else if (auto condition = parseCondition(inside)) {
                section.condition = condition;
            } else if (first == '$') {
                // Currency and locale tag [$text-locale]: only the text shows.
                literal(inside.substr(
                    1, inside.find('-') == std::string_view::npos ? std::string_view::npos : inside.find('-') - 1));
            }
        } else if (c == '0' || c == '#' || c == '?') {
            section.tokens.push_back(makeToken(TokenKind::Digit, std::string(1, c)));
        } else if (c == '.') {
            const bool afterSeconds = !section.tokens.empty()
                && (section.tokens.back().kind == TokenKind::Second
                    || section.tokens.back().kind == TokenKind::ElapsedSeconds);
            if (afterSeconds && i + 1 < code.size() && code[i + 1] == '0') {
                const int digits = runLength(i + 1);
                section.tokens.push_back(makeToken(TokenKind::Subsecond, {}, std::min(digits, 3)));
                i += 1 + static_cast<std::size_t>(digits);
                continue;
            }
            const bool seen = std::any_of(section.tokens.begin(), section.tokens.end(),
                [](const Token& t) { return t.kind == TokenKind::DecimalPoint; });
            if (seen) {
                literal(".");
            } else {
                section.tokens.push_back(makeToken(TokenKind::DecimalPoint, "."));
            }
        } else if (c == ',') {
            section.tokens.push_back(makeToken(TokenKind::Comma, ","));
        } else if (c == '%') {
            section.tokens.push_back(makeToken(TokenKind::Percent, "%"));
        } else if (lc == 'e' && i + 1 < code.size() && (code[i + 1] == '+' || code[i + 1] == '-')) {
            section.tokens.push_back(makeToken(TokenKind::Exponent, std::string(code.substr(i, 2))));
            i += 2;
            continue;
        } else if (c == '@') {
            section.tokens.push_back(makeToken(TokenKind::TextValue));
        } else if (startsWithIgnoringCase(code, i, "general")) {
            section.tokens.push_back(makeToken(TokenKind::General));
            i += 7;
            continue;
        } else if (startsWithIgnoringCase(code, i, "am/pm")) {
            section.tokens.push_back(makeToken(TokenKind::AmPm));
            section.tokens.back().am = "AM";
            section.tokens.back().pm = "PM";
            i += 5;
            continue;
        } else if (startsWithIgnoringCase(code, i, "a/p")) {
            section.tokens.push_back(makeToken(TokenKind::AmPm));
            section.tokens.back().am = std::string(1, code[i]);
            section.tokens.back().pm = std::string(1, code[i + 2]);
            i += 3;
            continue;
        } else if (lc == 'y' || lc == 'm' || lc == 'd' || lc == 'h' || lc == 's') {
            const int n = runLength(i);
            i += static_cast<std::size_t>(n);
            Token token = makeToken(TokenKind::Literal, {}, std::min(n, 2));
            switch (lc) {
            case 'y':
                token.kind = n <= 2 ? TokenKind::Year2 : TokenKind::Year4;
                break;
            case 'm':
                token.kind = n <= 2 ? TokenKind::Month
                    : n == 3        ? TokenKind::MonthAbbreviation
                    : n == 5        ? TokenKind::MonthLetter
                                    : TokenKind::MonthName;
                break;
            case 'd':
                token.kind = n <= 2 ? TokenKind::Day : n == 3 ? TokenKind::DayAbbreviation : TokenKind::DayName;
                break;
            case 'h':
                token.kind = TokenKind::Hour;
                break;
            default:
                token.kind = TokenKind::Second;
                break;
            }
            section.tokens.push_back(token);
            continue;
        } else {
            literal(code.substr(i, characterLength(code, i)));
            i += characterLength(code, i);
            continue;
        }
        // One-character tokens end here; quoted text, escapes, spacing, fills and brackets have
        // already moved past themselves.
        if (c != '"' && c != '\\' && c != '_' && c != '*' && c != '[') {
            ++i;
        }
    }
    section.resolve();
    return section;
}

// Settles what the tokens mean together: m as month or minute, commas as thousands separators or
// scaling, and what kind of value the section formats.
void NumberFormat::Section::resolve()
{
    for (std::size_t k = 0; k < tokens.size(); ++k) {
        if (tokens[k].kind != TokenKind::Month) {
            continue;
        }
        std::optional<TokenKind> before;
        for (std::size_t j = k; j-- > 0;) {
            if (tokens[j].kind != TokenKind::Literal) {
                before = tokens[j].kind;
                break;
            }
        }
        std::optional<TokenKind> after;
        for (std::size_t j = k + 1; j < tokens.size(); ++j) {
            if (tokens[j].kind != TokenKind::Literal) {
                after = tokens[j].kind;
                break;
            }
        }
        const bool afterHour = before && (*before == TokenKind::Hour || *before == TokenKind::ElapsedHours);
        const bool beforeSecond = after && (*after == TokenKind::Second || *after == TokenKind::ElapsedSeconds);
        if (afterHour || beforeSecond) {
            tokens[k].kind = TokenKind::Minute;
        }
    }

    // Commas: between digit placeholders of the integer part they group thousands; right after
    // the number's last placeholder each one divides by 1000; anywhere else they are literal.
    std::optional<std::size_t> lastIntegerDigit;
    std::optional<std::size_t> lastDigit;
    bool inInteger = true;
    for (std::size_t k = 0; k < tokens.size(); ++k) {
        if (tokens[k].kind == TokenKind::Exponent) {
            break;
        }
        if (tokens[k].kind == TokenKind::DecimalPoint) {
            inInteger = false;
        }
        if (tokens[k].kind == TokenKind::Digit) {
            lastDigit = k;
            if (inInteger) {
                lastIntegerDigit = k;
            }
        }
    }
    std::vector<bool> isComma;
    for (const Token& token : tokens) {
        isComma.push_back(token.kind == TokenKind::Comma);
    }
    bool seenDigit = false;
    for (std::size_t k = 0; k < tokens.size(); ++k) {
        Token& token = tokens[k];
        if (token.kind == TokenKind::Digit) {
            seenDigit = true;
        }
        if (token.kind != TokenKind::Comma) {
            continue;
        }
        if (seenDigit && lastIntegerDigit && k < *lastIntegerDigit) {
            groupThousands = true;
            token.kind = TokenKind::Literal;
            token.text.clear();
        } else if (seenDigit && lastDigit && k > *lastDigit) {
            bool trailing = true;
            for (std::size_t j = *lastDigit + 1; j < k; ++j) {
                trailing = trailing && isComma[j];
            }
            token.kind = TokenKind::Literal;
            if (trailing) {
                ++scaleCommas;
                token.text.clear();
            }
        } else {
            token.kind = TokenKind::Literal;
        }
    }

    for (const Token& token : tokens) {
        switch (token.kind) {
        case TokenKind::Digit:
            hasDigits = true;
            break;
        case TokenKind::Percent:
            ++percentCount;
            break;
        case TokenKind::Exponent:
            hasExponent = true;
            break;
        case TokenKind::TextValue:
            hasText = true;
            break;
        case TokenKind::General:
            hasGeneral = true;
            break;
        case TokenKind::AmPm:
            hasAmPm = true;
            isDateTime = true;
            break;
        case TokenKind::Subsecond:
            subsecondDigits = std::max(subsecondDigits, token.width);
            isDateTime = true;
            break;
        case TokenKind::Literal:
        case TokenKind::DecimalPoint:
        case TokenKind::Comma:
        case TokenKind::Fill:
            break;
        default: // every date and time part
            isDateTime = true;
            break;
        }
    }
}

// The digits of the number placed into the placeholders of the section, with its literals.
std::string NumberFormat::Section::formatDigits(double value, bool withSign, std::size_t& fillOffset) const
{
    value = std::fabs(value);
    for (int k = 0; k < percentCount; ++k) {
        value *= 100.0;
    }
    for (int k = 0; k < scaleCommas; ++k) {
        value /= 1000.0;
    }

    std::vector<const Token*> integerPlaces;
    std::vector<const Token*> fractionPlaces;
    std::vector<const Token*> exponentPlaces;
    int part = 0; // 0 integer, 1 fraction, 2 exponent
    for (const Token& token : tokens) {
        if (token.kind == TokenKind::DecimalPoint && part == 0) {
            part = 1;
        } else if (token.kind == TokenKind::Exponent) {
            part = 2;
        } else if (token.kind == TokenKind::Digit) {
            (part == 0 ? integerPlaces : part == 1 ? fractionPlaces : exponentPlaces).push_back(&token);
        }
    }
    const int fractionCount = static_cast<int>(fractionPlaces.size());

    int exponent = 0;
    if (hasExponent && value != 0.0) {
        const int magnitude = decimalExponent(value);
        const int places = std::max(static_cast<int>(integerPlaces.size()), 1);
        const bool engineering = places > 1
            && std::any_of(integerPlaces.begin(), integerPlaces.end(), [](const Token* t) { return t->text == "#"; });
        exponent = engineering ? static_cast<int>(std::floor(static_cast<double>(magnitude) / places)) * places
                               : magnitude - (places - 1);
        if (fixedDigits(value / std::pow(10.0, exponent), fractionCount).integer.size()
            > static_cast<std::size_t>(places)) {
            exponent += engineering ? places : 1; // rounding carried into one more digit
        }
        value /= std::pow(10.0, exponent);
    }
    FixedDigits digits = fixedDigits(value, fractionCount);

    // Fraction: trailing zeros under # vanish and under ? become spaces.
    std::string fraction = digits.fraction;
    for (int k = fractionCount - 1; k >= 0; --k) {
        const std::string& place = fractionPlaces[static_cast<std::size_t>(k)]->text;
        if (fraction[static_cast<std::size_t>(k)] != '0' || place == "0") {
            break;
        }
        fraction[static_cast<std::size_t>(k)] = place == "?" ? ' ' : '\0';
    }

    // Integer part: the placeholders take the digits from the right; the leftmost takes all the
    // digits that are left over.
    const std::string& integerDigits = digits.integer;
    const int placeCount = static_cast<int>(integerPlaces.size());
    const int digitCount = static_cast<int>(integerDigits.size());
    std::string out;
    if (withSign) {
        out.push_back('-');
    }
    bool emitted = false;
    auto emitDigit = [&](char digit, int position) {
        out.push_back(digit);
        emitted = true;
        if (groupThousands && position > 0 && position % 3 == 0) {
            out.push_back(',');
        }
    };

    int integerIndex = 0;
    int fractionIndex = 0;
    int exponentIndex = 0;
    part = 0;
    for (const Token& token : tokens) {
        switch (token.kind) {
        case TokenKind::Digit:
            if (part == 0) {
                const int position = placeCount - 1 - integerIndex; // power of ten of this place
                if (integerIndex == 0) {
                    for (int p = digitCount - 1; p > position; --p) {
                        emitDigit(integerDigits[static_cast<std::size_t>(digitCount - 1 - p)], p);
                    }
                }
                if (position < digitCount) {
                    emitDigit(integerDigits[static_cast<std::size_t>(digitCount - 1 - position)], position);
                } else if (token.text == "0") {
                    emitDigit('0', position);
                } else if (token.text == "?") {
                    out.push_back(' ');
                }
                ++integerIndex;
            } else if (part == 1) {
                const char digit = fraction[static_cast<std::size_t>(fractionIndex++)];
                if (digit != '\0') {
                    out.push_back(digit);
                }
            } else {
                const int places = static_cast<int>(exponentPlaces.size());
                const std::string text = integerText(exponent < 0 ? -exponent : exponent, places);
                if (exponentIndex == 0) {
                    out += text.substr(0, text.size() - static_cast<std::size_t>(places - 1));
                } else {
                    out.push_back(text[text.size() - static_cast<std::size_t>(places - exponentIndex)]);
                }
                ++exponentIndex;
            }
            break;
        case TokenKind::DecimalPoint:
            out.push_back('.');
            part = 1;
            break;
        case TokenKind::Exponent:
            out.push_back(token.text[0]);
            if (exponent < 0) {
                out.push_back('-');
            } else if (token.text[1] == '+') {
                out.push_back('+');
            }
            part = 2;
            break;
        case TokenKind::Percent:
        case TokenKind::Literal:
            out += token.text;
            break;
        case TokenKind::Fill:
            if (fillOffset == std::string::npos) {
                fillOffset = out.size();
            }
            break;
        default:
            break;
        }
    }
    return out;
}

std::vector<ShownForm> NumberFormat::Section::assemble(
    const std::vector<std::string>& replacements, TokenKind replaced) const
{
    std::vector<ShownForm> forms;
    for (const std::string& replacement : replacements) {
        ShownForm form;
        for (const Token& token : tokens) {
            if (token.kind == replaced) {
                form.text += replacement;
            } else if (token.kind == TokenKind::Literal || token.kind == TokenKind::Percent) {
                form.text += token.text;
            } else if (token.kind == TokenKind::Fill && form.fillOffset == std::string::npos) {
                form.fillOffset = form.text.size();
                form.fillCharacter = token.text;
            }
        }
        forms.push_back(std::move(form));
    }
    return forms;
}

std::vector<ShownForm> NumberFormat::Section::showNumber(double value, bool withSign) const
{
    if (isDateTime) {
        return showDateTime(value);
    }
    if (hasDigits) {
        ShownForm form;
        form.text = formatDigits(value, withSign, form.fillOffset);
        if (form.fillOffset != std::string::npos) {
            const auto fill
                = std::find_if(tokens.begin(), tokens.end(), [](const Token& t) { return t.kind == TokenKind::Fill; });
            form.fillCharacter = fill->text;
        }
        return { form };
    }
    if (hasGeneral) {
        return assemble(generalNumberForms(withSign ? -std::fabs(value) : std::fabs(value)), TokenKind::General);
    }
    // Only literals, or nothing at all: the number itself does not show.
    std::vector<ShownForm> forms = assemble({ std::string() }, TokenKind::General);
    if (withSign) {
        forms.front().text.insert(0, "-");
    }
    return forms;
}

void NumberFormat::Section::appendDateTime(std::string& out, const Token& token, const DateTimeParts& parts) const
{
    const auto two = [](long long n, int width) { return integerText(n, width); };
    switch (token.kind) {
    case TokenKind::Year2:
        out += two(parts.year % 100, 2);
        break;
    case TokenKind::Year4:
        out += two(parts.year, 4);
        break;
    case TokenKind::Month:
        out += two(parts.month, token.width);
        break;
    case TokenKind::MonthAbbreviation:
        out += kMonthNames[static_cast<std::size_t>(parts.month - 1)].substr(0, 3);
        break;
    case TokenKind::MonthName:
        out += kMonthNames[static_cast<std::size_t>(parts.month - 1)];
        break;
    case TokenKind::MonthLetter:
        out += kMonthNames[static_cast<std::size_t>(parts.month - 1)].substr(0, 1);
        break;
    case TokenKind::Day:
        out += two(parts.day, token.width);
        break;
    case TokenKind::DayAbbreviation:
        out += kDayNames[static_cast<std::size_t>(parts.weekday)].substr(0, 3);
        break;
    case TokenKind::DayName:
        out += kDayNames[static_cast<std::size_t>(parts.weekday)];
        break;
    case TokenKind::Hour: {
        int hour = parts.hour;
        if (hasAmPm) {
            hour %= 12;
            hour = hour == 0 ? 12 : hour;
        }
        out += two(hour, token.width);
        break;
    }
    case TokenKind::Minute:
        out += two(parts.minute, token.width);
        break;
    case TokenKind::Second:
        out += two(parts.second, token.width);
        break;
    case TokenKind::ElapsedHours:
        out += two(parts.wholeDays * 24 + parts.hour, token.width);
        break;
    case TokenKind::ElapsedMinutes:
        out += two((parts.wholeDays * 24 + parts.hour) * 60 + parts.minute, token.width);
        break;
    case TokenKind::ElapsedSeconds:
        out += two(((parts.wholeDays * 24 + parts.hour) * 60 + parts.minute) * 60 + parts.second, token.width);
        break;
    case TokenKind::Subsecond: {
        const std::string digits = two(parts.subsecond, subsecondDigits);
        out += '.' + digits.substr(0, static_cast<std::size_t>(token.width));
        break;
    }
    case TokenKind::AmPm:
        out += parts.hour < 12 ? token.am : token.pm;
        break;
    case TokenKind::Literal:
    case TokenKind::Percent:
    case TokenKind::DecimalPoint:
    case TokenKind::Digit:
        out += token.text;
        break;
    default:
        break;
    }
}

std::vector<ShownForm> NumberFormat::Section::showDateTime(double serial) const
{
    const std::optional<DateTimeParts> parts = splitSerial(serial, subsecondDigits);
    if (!parts) {
        return {};
    }
    ShownForm form;
    for (const Token& token : tokens) {
        if (token.kind == TokenKind::Fill) {
            form.fillOffset = form.text.size();
            form.fillCharacter = token.text;
        } else {
            appendDateTime(form.text, token, *parts);
        }
    }
    return { form };
}

ShownForm NumberFormat::Section::showText(const std::string& text) const
{
    return assemble({ text }, TokenKind::TextValue).front();
}

NumberFormat::NumberFormat(std::string_view code)
{
    if (code.empty()) {
        code = "General";
    }
    // Sections split at semicolons outside quotes, brackets and escapes.
    std::size_t start = 0;
    bool quoted = false;
    bool bracketed = false;
    for (std::size_t i = 0; i <= code.size(); ++i) {
        if (i == code.size() || (code[i] == ';' && !quoted && !bracketed)) {
            m_sections.push_back(Section::parse(code.substr(start, i - start)));
            start = i + 1;
            continue;
        }
        const char c = code[i];
        if (c == '\\' && !quoted && i + 1 < code.size()) {
            ++i;
        } else if (c == '"') {
            quoted = !quoted;
        } else if (!quoted && c == '[') {
            bracketed = true;
        } else if (!quoted && c == ']') {
            bracketed = false;
        }
    }
}

NumberFormat::~NumberFormat() = default;
NumberFormat::NumberFormat(NumberFormat&&) noexcept = default;
NumberFormat& NumberFormat::operator=(NumberFormat&&) noexcept = default;

ShownValue NumberFormat::show(const xl::Value& value) const
{
    ShownValue shown;
    if (const auto* number = std::get_if<double>(&value)) {
        shown.isNumber = true;
        const double x = *number;
        const std::size_t numericSections = std::min<std::size_t>(m_sections.size(), 3);
        const bool anyCondition
            = std::any_of(m_sections.begin(), m_sections.begin() + static_cast<long>(numericSections),
                [](const Section& s) { return s.condition.has_value(); });
        std::optional<std::size_t> chosen;
        if (!anyCondition) {
            if (numericSections == 1) {
                chosen = 0;
            } else if (numericSections == 2) {
                chosen = x < 0 ? 1 : 0;
            } else {
                chosen = x > 0 ? 0 : x < 0 ? 1 : 2;
            }
        } else {
            for (std::size_t k = 0; k < numericSections && !chosen; ++k) {
                if (!m_sections[k].condition || m_sections[k].condition->matches(x)) {
                    chosen = k;
                }
            }
        }
        if (!chosen) {
            return shown; // no section takes this number
        }
        const Section& section = m_sections[*chosen];
        if (section.hasText && !section.hasDigits && !section.hasGeneral && !section.isDateTime) {
            // A text-only format shows numbers as General does.
            for (std::string& text : generalNumberForms(x)) {
                shown.forms.push_back(plainForm(std::move(text)));
            }
            return shown;
        }
        const bool withSign = x < 0 && *chosen != 1 && !section.condition;
        shown.color = section.color;
        shown.forms = section.isDateTime && x < 0 ? std::vector<ShownForm> {} : section.showNumber(x, withSign);
        return shown;
    }
    if (const auto* text = std::get_if<std::string>(&value)) {
        const Section* textSection = m_sections.size() >= 4   ? &m_sections[3]
            : m_sections.size() == 1 && m_sections[0].hasText ? &m_sections[0]
                                                              : nullptr;
        if (textSection) {
            shown.color = textSection->color;
            shown.forms.push_back(textSection->showText(*text));
        } else {
            shown.forms.push_back(plainForm(*text));
        }
        return shown;
    }
    if (const auto* flag = std::get_if<bool>(&value)) {
        shown.forms.push_back(plainForm(*flag ? "TRUE" : "FALSE"));
        return shown;
    }
    if (const auto* error = std::get_if<xl::ErrorValue>(&value)) {
        static constexpr std::array<std::pair<xl::ErrorValue, std::string_view>, 7> kErrors { {
            { xl::ErrorValue::Null, "#NULL!" },
            { xl::ErrorValue::Div0, "#DIV/0!" },
            { xl::ErrorValue::Value, "#VALUE!" },
            { xl::ErrorValue::Ref, "#REF!" },
            { xl::ErrorValue::Name, "#NAME?" },
            { xl::ErrorValue::Num, "#NUM!" },
            { xl::ErrorValue::NA, "#N/A" },
        } };
        for (const auto& [code, text] : kErrors) {
            if (code == *error) {
                shown.forms.push_back(plainForm(std::string(text)));
            }
        }
        return shown;
    }
    shown.forms.push_back(ShownForm {});
    return shown;
}

GeneralSide generalSide(const xl::Value& value)
{
    if (std::holds_alternative<double>(value)) {
        return GeneralSide::Right;
    }
    if (std::holds_alternative<bool>(value) || std::holds_alternative<xl::ErrorValue>(value)) {
        return GeneralSide::Center;
    }
    return GeneralSide::Left;
}

} // namespace penmoor::picture
