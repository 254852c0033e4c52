#pragma once

#include "automation/contract/value.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace penmoor::picture {

// Colour that a format section asks for: none (the font's own), a fixed colour ([Red]) or an
// entry of the workbook palette ([Color10]).
struct FormatColor {
    enum class Kind { None, Rgb, Palette };
    Kind kind = Kind::None;
    std::uint32_t value = 0; // 0xRRGGBB for Rgb, 1 to 56 for Palette

    friend bool operator==(const FormatColor&, const FormatColor&) = default;
};

// One way of showing a value. fillOffset marks where a repeated character ("*-") goes, which the
// layout repeats until the text fills its cell.
struct ShownForm {
    std::string text;
    std::size_t fillOffset = std::string::npos;
    std::string fillCharacter;
};

// What a cell shows for its value: the forms to try, best first (several only for numbers in
// General, which shorten to fit), the colour of the format section, and whether the value is a
// number, which never spills into neighbours and shows "#" signs when no form fits.
struct ShownValue {
    std::vector<ShownForm> forms; // empty: the value cannot be shown in this format ("#" signs)
    FormatColor color;
    bool isNumber = false;
};

// Horizontal side of a value under General alignment: numbers right, text left, booleans and
// error values centred.
enum class GeneralSide { Left, Center, Right };
GeneralSide generalSide(const xl::Value& value);

// A number format code of the spreadsheet application ("General", "#,##0", "0.00%",
// "mmm-yy", "[Red]#,##0;(#,##0)", "\"Total \"@", ...), parsed once and applied to values.
// Parsing never fails: what the format language does not know is shown literally.
class NumberFormat {
public:
    explicit NumberFormat(std::string_view code);
    ~NumberFormat();
    NumberFormat(NumberFormat&&) noexcept;
    NumberFormat& operator=(NumberFormat&&) noexcept;

    ShownValue show(const xl::Value& value) const;

private:
    struct Section;
    std::vector<Section> m_sections;
};

} // namespace penmoor::picture
