#include "model/options.h"

#include "model/defaultlist.h"
#include "model/itemrules.h"
#include "model/linkage.h"
#include "model/numbertext.h"
#include "model/settingskeys.h"
#include "model/storedvalue.h"

#include <optional>
#include <stdexcept>
#include <utility>

namespace penmoor {

namespace {

constexpr char kDefaultWeeks[] = "5";

std::vector<std::string> defaultNames()
{
    return { kDefaultItemNames.begin(), kDefaultItemNames.end() };
}

} // namespace

Options::Options(SettingsStore& store, MainWindowView& view, YearSource currentYear)
    : m_store(store)
    , m_view(view)
    , m_currentYear(std::move(currentYear))
{
}

void Options::LoadOptions(LoadMode mode)
{
    const bool reset = mode == LoadMode::RestoreDefaults;
    std::vector<std::string> names;
    if (reset) {
        names = defaultNames();
    } else {
        // A count or flag that the program did not write (not a whole number, out of range)
        // means the stored list cannot be trusted, so the default list is used.
        const std::optional<int> rows = readStoredCount(m_store.read(kRowsKey, "44"), kMaximumItemCount);
        const bool saved = readStoredBoolean(m_store.read(kSavedKey, "False"), false);
        if (rows && saved) {
            names.reserve(static_cast<std::size_t>(*rows));
            for (int position = 1; position <= *rows; ++position) {
                names.push_back(m_store.read(fieldKey(position), ""));
            }
        } else {
            names = defaultNames();
        }
    }

    m_items.clear();
    m_items.reserve(names.size());
    for (std::string& name : names) {
        TemplateItem item;
        if (!reset && !isProgramKey(name)) {
            item.included = readStoredBoolean(m_store.read(name, "True"), true);
        }
        item.name = std::move(name);
        m_items.push_back(std::move(item));
    }
    m_index.rebuild(m_items);
    RelistItems();
    if (!m_items.empty()) {
        m_view.setSelectedListIndex(0);
    }

    if (reset) {
        loadDefaultBoxes();
    } else {
        loadStoredBoxes();
    }
    m_palette = kPaletteColours;
}

void Options::loadStoredBoxes()
{
    const std::string year = std::to_string(m_currentYear());
    // The period boxes show the leading number of what was stored, so a box emptied before
    // the last close shows 0.
    const auto storedNumber = [&](const std::string& key, const std::string& fallback) {
        return numberText(numericValue(m_store.read(key, fallback)));
    };
    m_view.setText(TextBox::Text2, storedNumber(kYearKey, year));
    m_view.setText(TextBox::Text3, storedNumber(kYear1Key, year));
    m_view.setText(TextBox::Text4, storedNumber(kWeeksKey, kDefaultWeeks));
    m_view.setText(TextBox::Text1, m_store.read(kCompanyKey, ""));
    // The group keeps one button on, so when both are stored true the later one, By Month, wins.
    m_view.setOptionOn(OptionButton::Option1, readStoredBoolean(m_store.read(kIsYearKey, "True"), true));
    m_view.setOptionOn(OptionButton::Option3, readStoredBoolean(m_store.read(kIsMonthKey, "True"), true));
    m_view.setOptionOn(
        OptionButton::Option2, !m_view.isOptionOn(OptionButton::Option1) && !m_view.isOptionOn(OptionButton::Option3));
}

void Options::loadDefaultBoxes()
{
    const std::string year = std::to_string(m_currentYear());
    m_view.setText(TextBox::Text2, year);
    m_view.setText(TextBox::Text3, year);
    m_view.setText(TextBox::Text4, kDefaultWeeks);
    m_view.setText(TextBox::Text1, "");
    m_view.setOptionOn(OptionButton::Option1, false);
    m_view.setOptionOn(OptionButton::Option3, true);
    m_view.setOptionOn(OptionButton::Option2, false);
}

const TemplateItem& Options::item(int position) const
{
    checkPosition(position, 1, count());
    return m_items[static_cast<std::size_t>(position - 1)];
}

void Options::setIncluded(int position, bool included)
{
    checkPosition(position, 1, count());
    m_items[static_cast<std::size_t>(position - 1)].included = included;
}

void Options::setSheetRow(int position, int row)
{
    checkPosition(position, 1, count());
    m_items[static_cast<std::size_t>(position - 1)].sheetRow = row;
}

int Options::FindItemRow(std::string_view name) const
{
    return m_index.lastPosition(name);
}

std::string Options::ItemLinks(std::string_view name) const
{
    return linkageFor(name, m_index);
}

void Options::RefreshDerivedFields(int position)
{
    checkPosition(position, 1, count());
    TemplateItem& item = m_items[static_cast<std::size_t>(position - 1)];
    item.linkage = ItemLinks(item.name);
    item.totalKind = ItemOperation(item.name);
    item.section = IsHeadingItem(item.name);
}

void Options::RelistItems()
{
    std::vector<std::string> names;
    names.reserve(m_items.size());
    int lastIncluded = 0;
    for (int position = 1; position <= count(); ++position) {
        RefreshDerivedFields(position);
        const TemplateItem& current = m_items[static_cast<std::size_t>(position - 1)];
        names.push_back(current.name);
        if (current.included) {
            lastIncluded = position;
        }
    }
    m_view.replaceListEntries(std::move(names));
    // List1 keeps one selected entry, so marking every included entry in turn leaves the last.
    m_view.setSelectedListIndex(lastIncluded - 1);
}

void Options::InsertItem(const std::string& name, int after)
{
    if (count() >= kMaximumItemCount) {
        throw std::length_error("The item list is full: it cannot hold more than " + std::to_string(kMaximumItemCount)
            + " items. Delete an item before inserting a new one.");
    }
    checkPosition(after, 0, count());
    TemplateItem item;
    item.name = name;
    m_items.insert(m_items.begin() + after, std::move(item));
    relistAndSelect(after);
}

void Options::RenameItem(const std::string& name, int at)
{
    checkPosition(at, 1, count());
    m_items[static_cast<std::size_t>(at - 1)].name = name;
    relistAndSelect(at - 1);
}

void Options::DeleteItem(int at)
{
    checkPosition(at, 1, count());
    m_items.erase(m_items.begin() + (at - 1));
    relistAndSelect(at > count() ? at - 2 : at - 1);
}

void Options::TakeListMarks()
{
    const int selected = m_view.selectedListIndex();
    for (int position = 1; position <= count(); ++position) {
        m_items[static_cast<std::size_t>(position - 1)].included = position - 1 == selected;
    }
}

void Options::SaveOptions()
{
    const int selected = m_view.selectedListIndex();
    for (int position = 1; position <= count(); ++position) {
        const std::string& name = m_items[static_cast<std::size_t>(position - 1)].name;
        if (!isProgramKey(name)) {
            m_store.write(name, booleanText(position - 1 == selected));
        }
    }
    m_store.write(kCompanyKey, m_view.text(TextBox::Text1));
    m_store.write(kYearKey, m_view.text(TextBox::Text2));
    m_store.write(kYear1Key, m_view.text(TextBox::Text3));
    m_store.write(kWeeksKey, m_view.text(TextBox::Text4));
    m_store.write(kIsYearKey, booleanText(m_view.isOptionOn(OptionButton::Option1)));
    m_store.write(kIsMonthKey, booleanText(m_view.isOptionOn(OptionButton::Option3)));
    for (int position = 1; position <= count(); ++position) {
        m_store.write(fieldKey(position), m_items[static_cast<std::size_t>(position - 1)].name);
    }
    m_store.write(kRowsKey, std::to_string(count()));
    m_store.write(kColumnsKey, std::to_string(kTemplateItemFieldCount));
    m_store.write(kSavedKey, booleanText(true));
    m_store.sync();
}

void Options::checkPosition(int position, int lowest, int highest) const
{
    if (position < lowest || position > highest) {
        throw std::out_of_range("There is no item position " + std::to_string(position) + " in a list of "
            + std::to_string(count()) + " items");
    }
}

void Options::relistAndSelect(int listIndex)
{
    m_index.rebuild(m_items);
    RelistItems();
    m_view.setSelectedListIndex(listIndex);
}

} // namespace penmoor
