#pragma once

#include "model/qsettingsstore.h"
#include "shell/qtpaths.h"
#include "spreadsheet/builtin/builtinapplication.h"
#include "tests/support/scripteddialogs.h"
#include "tests/support/temporaryfolder.h"
#include "ui/main/form1.h"

#include <memory>
#include <string>
#include <vector>

#include <QApplication>
#include <QPushButton>
#include <QRadioButton>
#include <QTest>

#include <gtest/gtest.h>

namespace penmoor::testing {

inline constexpr int kTestYear = 2031;
using namespace std::chrono_literals;

// A main window started as the program starts it, with its settings in an INI file of a
// temporary folder, scripted dialogs and a program folder of its own.
class Form1Test : public ::testing::Test {
protected:
    Form1Test() { openStore(); }

    // A store on the same file, as the next run of the program would open it.
    void openStore() { store = std::make_unique<QSettingsStore>(toQString(config / "Penmoor.ini")); }

    std::string stored(const std::string& key) const { return store->read(key, "<absent>"); }

    Form1Setup setup(SettingsStore& settings) { return setup(settings, spreadsheets); }
    Form1Setup setup(SettingsStore& settings, xl::ApplicationFactory& factory)
    {
        return { settings, dialogs, factory, program.path(), [] { return kTestYear; }, [this] { return draw; },
            [this](std::string_view address) { opened.emplace_back(address); }, 20ms };
    }

    // A new window on the current store, loaded.
    Form1& start()
    {
        window = std::make_unique<Form1>(setup(*store));
        window->load();
        return *window;
    }

    // Shows the window and gives it the focus, so that focus changes happen as with a user.
    void showActive()
    {
        window->show();
        QApplication::setActiveWindow(window.get());
        ASSERT_TRUE(QTest::qWaitForWindowActive(window.get()));
    }

    template <typename T = QWidget> T* control(const char* name) const
    {
        T* found = window->findChild<T*>(QLatin1String(name));
        EXPECT_NE(found, nullptr) << name;
        return found;
    }

    QPushButton* editButton(int index) const
    {
        for (QPushButton* button : window->findChildren<QPushButton*>(QStringLiteral("PushButton2"))) {
            if (button->property("index").toInt() == index) {
                return button;
            }
        }
        ADD_FAILURE() << "no PushButton2(" << index << ")";
        return nullptr;
    }

    void click(QAbstractButton* button) { QTest::mouseClick(button, Qt::LeftButton); }

    std::string selectedEntry() const
    {
        const int index = window->selectedListIndex();
        return index < 0 ? "<none>" : window->options().item(index + 1).name;
    }

    TemporaryFolder program;
    TemporaryFolder config;
    std::unique_ptr<QSettingsStore> store;
    ScriptedDialogs dialogs;
    engine::BuiltinApplicationFactory spreadsheets;
    // The start's draw for the maker's page: 7 in a hundred opens it, 0.5 does not.
    double draw = 0.5;
    std::vector<std::string> opened;
    std::unique_ptr<Form1> window;
};

} // namespace penmoor::testing
