#include "spreadsheet/picture/fontlibrary.h"

#include <array>
#include <cmath>
#include <mutex>
#include <string_view>

#include <QFontDatabase>
#include <QString>
#include <QStringList>

static void initPictureFontResources()
{
    Q_INIT_RESOURCE(picturefonts);
}

namespace penmoor::picture {

namespace {

QString builtInSansFamily()
{
    static QString family;
    static std::once_flag loaded;
    std::call_once(loaded, [] {
        initPictureFontResources();
        for (const char* file :
            { ":/penmoor/fonts/LiberationSans-Regular.ttf", ":/penmoor/fonts/LiberationSans-Bold.ttf",
                ":/penmoor/fonts/LiberationSans-Italic.ttf", ":/penmoor/fonts/LiberationSans-BoldItalic.ttf" }) {
            const int id = QFontDatabase::addApplicationFont(QString::fromLatin1(file));
            if (id >= 0 && family.isEmpty() && !QFontDatabase::applicationFontFamilies(id).isEmpty()) {
                family = QFontDatabase::applicationFontFamilies(id).front();
            }
        }
        if (family.isEmpty()) {
            family = QStringLiteral("Liberation Sans");
        }
    });
    return family;
}

bool sameName(std::string_view a, std::string_view b)
{
    return QString::fromUtf8(a.data(), static_cast<qsizetype>(a.size()))
               .compare(QString::fromUtf8(b.data(), static_cast<qsizetype>(b.size())), Qt::CaseInsensitive)
        == 0;
}

QString familyFor(const std::string& name)
{
    struct Substitute {
        std::string_view name;
        std::string_view family;
    };
    static constexpr std::array<Substitute, 3> kSubstitutes { {
        { "Times New Roman", "Liberation Serif" },
        { "Courier New", "Liberation Mono" },
        { "Arial Narrow", "Liberation Sans Narrow" },
    } };
    if (name.empty() || sameName(name, "Arial") || sameName(name, "Helvetica")) {
        return builtInSansFamily();
    }
    for (const Substitute& substitute : kSubstitutes) {
        if (sameName(name, substitute.name)) {
            return QString::fromLatin1(substitute.family.data(), static_cast<qsizetype>(substitute.family.size()));
        }
    }
    return QString::fromStdString(name);
}

} // namespace

QFont pictureFont(const FontSpec& spec)
{
    QFont font(familyFor(spec.name));
    font.setPixelSize(std::max(1, static_cast<int>(std::lround(spec.sizePoints * 96.0 / 72.0))));
    font.setBold(spec.bold);
    font.setItalic(spec.italic);
    font.setUnderline(spec.underline);
    font.setStrikeOut(spec.strikeout);
    // Whole-pixel glyph positions without kerning, as the spreadsheet application sets text.
    font.setHintingPreference(QFont::PreferFullHinting);
    font.setKerning(false);
    font.setStyleHint(QFont::SansSerif);
    return font;
}

} // namespace penmoor::picture
