#include "ui/main/form1.h"

#include "model/windowsettings.h"
#include "shell/applicationicon.h"
#include "shell/handpointer.h"
#include "shell/skin.h"
#include "shell/splash.h"
#include "shell/windowutils.h"
#include "ui/main/datacommands.h"
#include "ui/main/itemlist.h"
#include "ui/main/periodchecks.h"
#include "ui/main/selectalllineedit.h"
#include "ui/main/spreadsheetcheck.h"

#include <QCloseEvent>
#include <QFocusEvent>
#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QRadioButton>
#include <QTimer>
#include <QVBoxLayout>

namespace penmoor {

namespace {

QString fromUtf8(std::string_view text)
{
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

// Room for a year or a number of weeks, with a digit to spare.
int numberBoxWidth(const QLineEdit& box)
{
    const QMargins margins = box.textMargins();
    return box.fontMetrics().horizontalAdvance(QStringLiteral("000000")) + margins.left() + margins.right() + 12;
}

} // namespace

Form1::Form1(Form1Setup setup, QWidget* parent)
    : QWidget(parent)
    , m_settings(setup.settings)
    , m_dialogs(setup.dialogs)
    , m_spreadsheets(setup.spreadsheets)
    , m_programFolder(std::move(setup.programFolder))
    , m_currentYear(std::move(setup.currentYear))
    , m_random(std::move(setup.random))
    , m_openAddress(std::move(setup.openAddress))
    , m_splashTime(setup.splashTime)
    , m_options(m_settings, *this, m_currentYear)
    , m_editor(m_options, *this, *this, m_dialogs)
{
    setObjectName(QStringLiteral("Form1"));
    createControls();
    layOutControls();
    connectControls();
}

Form1::~Form1() = default;

void Form1::createControls()
{
    const auto makeBox = [this](QWidget* parent, TextBox which, const char* accessibleName) {
        auto* edit = new SelectAllLineEdit(parent);
        edit->setObjectName(fromUtf8(controlName(which)));
        edit->setAccessibleName(tr(accessibleName));
        m_boxes[static_cast<std::size_t>(which)] = edit;
        return edit;
    };
    const auto makeButton = [this](QWidget* parent, const char* name, const char* caption) {
        auto* button = new QPushButton(tr(caption), parent);
        button->setObjectName(QLatin1String(name));
        button->setAutoDefault(false);
        return button;
    };

    m_frame6 = new QGroupBox(tr("Company Name"), this);
    m_frame6->setObjectName(QStringLiteral("Frame6"));
    makeBox(m_frame6, TextBox::Text1, "Company name");

    m_frame4 = new QGroupBox(tr("Template Items"), this);
    m_frame4->setObjectName(QStringLiteral("Frame4"));
    m_list1 = new ItemList(m_frame4);
    m_list1->setObjectName(QStringLiteral("List1"));
    m_list1->setAccessibleName(tr("Template items"));
    const std::array<const char*, 3> editCaptions
        = { "Insert New Below Selected", "Rename Selected", "Delete Selected" };
    for (std::size_t index = 0; index < m_pushButton2.size(); ++index) {
        m_pushButton2[index] = makeButton(m_frame4, "PushButton2", editCaptions[index]);
        // The control array's index, as the click handler receives it.
        m_pushButton2[index]->setProperty("index", static_cast<int>(index));
    }
    m_pushButton3 = makeButton(m_frame4, "PushButton3", "Restore Default Template Items");

    m_frame1 = new QGroupBox(tr("How often?"), this);
    m_frame1->setObjectName(QStringLiteral("Frame1"));
    const auto makeOption = [this](OptionButton which, const char* caption) {
        auto* radio = new QRadioButton(tr(caption), m_frame1);
        radio->setObjectName(fromUtf8(controlName(which)));
        m_optionButtons[static_cast<std::size_t>(which)] = radio;
    };
    makeOption(OptionButton::Option3, "By Month");
    makeOption(OptionButton::Option1, "By Year");
    makeOption(OptionButton::Option2, "By Week");
    makeBox(m_frame1, TextBox::Text6, "First year by month");
    makeBox(m_frame1, TextBox::Text7, "Last year by month");
    makeBox(m_frame1, TextBox::Text2, "First year by year");
    makeBox(m_frame1, TextBox::Text3, "Last year by year");
    makeBox(m_frame1, TextBox::Text4, "Number of weeks");
    m_label2 = new QLabel(tr("to"), m_frame1);
    m_label2->setObjectName(QStringLiteral("Label2"));
    m_label3 = new QLabel(tr("to"), m_frame1);
    m_label3->setObjectName(QStringLiteral("Label3"));

    m_pushButton5 = makeButton(this, "PushButton5", "Clear/Reset Data");
    m_pushButton6 = makeButton(this, "PushButton6", "Load Sample/Example Data");
    m_pushButton22 = makeButton(this, "PushButton22", "Start Creating Template");
}

void Form1::layOutControls()
{
    auto* companyLayout = new QHBoxLayout(m_frame6);
    companyLayout->addWidget(box(TextBox::Text1));

    // The list with its four buttons in a column beside it.
    auto* itemsLayout = new QHBoxLayout(m_frame4);
    itemsLayout->addWidget(m_list1, 1);
    auto* editorButtons = new QVBoxLayout;
    for (QPushButton* button : m_pushButton2) {
        editorButtons->addWidget(button);
    }
    editorButtons->addSpacing(fontMetrics().height());
    editorButtons->addWidget(m_pushButton3);
    editorButtons->addStretch(1);
    itemsLayout->addLayout(editorButtons);
    // Wide enough for the longest default name, tall enough for a screenful of lines.
    m_list1->setMinimumSize(
        m_list1->fontMetrics().horizontalAdvance(QStringLiteral("ESSENTIAL OPERATING DATA (non cash flow information)"))
            + 2 * m_list1->frameWidth() + 24,
        m_list1->fontMetrics().lineSpacing() * 14);

    // The three period rows, their boxes in aligned columns.
    auto* periodLayout = new QGridLayout(m_frame1);
    const auto addPeriodRow = [&](int row, OptionButton which, TextBox first, QLabel* to, std::optional<TextBox> last) {
        periodLayout->addWidget(option(which), row, 0);
        periodLayout->addWidget(box(first), row, 1);
        if (to && last) {
            periodLayout->addWidget(to, row, 2, Qt::AlignCenter);
            periodLayout->addWidget(box(*last), row, 3);
        }
    };
    addPeriodRow(0, OptionButton::Option3, TextBox::Text6, m_label2, TextBox::Text7);
    addPeriodRow(1, OptionButton::Option1, TextBox::Text2, m_label3, TextBox::Text3);
    addPeriodRow(2, OptionButton::Option2, TextBox::Text4, nullptr, std::nullopt);
    for (const TextBox number : { TextBox::Text2, TextBox::Text3, TextBox::Text4, TextBox::Text6, TextBox::Text7 }) {
        box(number)->setFixedWidth(numberBoxWidth(*box(number)));
    }
    periodLayout->setColumnMinimumWidth(0, option(OptionButton::Option3)->sizeHint().width() + fontMetrics().height());
    periodLayout->setColumnStretch(4, 1);

    // Some styles fit a button tightly around its caption; a character's width of air on each
    // side reads better. A larger font later (the skin) still widens the button beyond this.
    for (QPushButton* button : findChildren<QPushButton*>()) {
        button->setMinimumWidth(button->sizeHint().width() + 2 * button->fontMetrics().averageCharWidth());
    }

    auto* commands = new QHBoxLayout;
    commands->addWidget(m_pushButton5);
    commands->addWidget(m_pushButton6);
    commands->addStretch(1);
    commands->addWidget(m_pushButton22);

    auto* windowLayout = new QVBoxLayout(this);
    windowLayout->addWidget(m_frame6);
    windowLayout->addWidget(m_frame4, 1);
    windowLayout->addWidget(m_frame1);
    windowLayout->addSpacing(fontMetrics().height() / 2);
    windowLayout->addLayout(commands);

    // Keyboard order: top to bottom, left to right, as the window reads.
    QWidget* previous = box(TextBox::Text1);
    for (QWidget* next : std::initializer_list<QWidget*> { m_list1, m_pushButton2[0], m_pushButton2[1],
             m_pushButton2[2], m_pushButton3, option(OptionButton::Option3), box(TextBox::Text6), box(TextBox::Text7),
             option(OptionButton::Option1), box(TextBox::Text2), box(TextBox::Text3), option(OptionButton::Option2),
             box(TextBox::Text4), m_pushButton5, m_pushButton6, m_pushButton22 }) {
        setTabOrder(previous, next);
        previous = next;
    }
}

void Form1::connectControls()
{
    for (const TextBox stored : { TextBox::Text2, TextBox::Text3, TextBox::Text4, TextBox::Text6, TextBox::Text7 }) {
        connect(box(stored), &QLineEdit::textChanged, this,
            [this, stored](const QString& text) { StoreBoxText(m_settings, stored, text.toStdString()); });
    }
    for (const TextBox checked : { TextBox::Text2, TextBox::Text3, TextBox::Text4 }) {
        box(checked)->installEventFilter(this);
    }
    // A click on an option, or an option turned on by the program, stores all three states.
    for (QRadioButton* radio : m_optionButtons) {
        connect(radio, &QRadioButton::toggled, this, [this](bool on) {
            if (on) {
                StoreOptionStates(m_settings, *this);
            }
        });
    }

    for (QPushButton* button : m_pushButton2) {
        const int index = button->property("index").toInt();
        connect(button, &QPushButton::clicked, this,
            [this, index] { runCommand([this, index] { m_editor.PushButton2_Click(index); }); });
    }
    connect(
        m_pushButton3, &QPushButton::clicked, this, [this] { runCommand([this] { m_editor.PushButton3_Click(); }); });
    connect(m_pushButton5, &QPushButton::clicked, this,
        [this] { runCommand([this] { ClearResetData(*this, m_editor, m_dialogs); }); });
    connect(m_pushButton6, &QPushButton::clicked, this,
        [this] { runCommand([this] { LoadSampleData(*this, m_dialogs); }); });
    connect(m_pushButton22, &QPushButton::clicked, this, [this] {
        runCommand([this] {
            if (m_startCommand) {
                m_startCommand();
            }
        });
    });
}

void Form1::load()
{
    adjustSize();
    CenterForm(*this);
    ApplySkin(*this, m_programFolder);
    setWindowTitle(QStringLiteral("Penmoor"));
    setWindowIcon(applicationIcon());
    lockDrawing();
    m_customPointer = loadHandPointer(m_programFolder);
    for (QPushButton* button : findChildren<QPushButton*>()) {
        button->setCursor(m_customPointer);
    }
    OpenMakerPage(m_random, m_openAddress);
    m_splash = std::make_unique<Splash>(m_settings, m_programFolder, m_splashTime);
    m_splash->SplashShow();
    LoadWindowSettings(m_settings, *this, m_currentYear());
    m_options.LoadOptions(LoadMode::FromStore);
    unlockDrawing();
    CheckExcelInstalled(m_spreadsheets, m_dialogs);
}

void Form1::setStartCommand(std::function<void()> command)
{
    m_startCommand = std::move(command);
}

void Form1::writeSettings()
{
    try {
        m_options.SaveOptions();
    } catch (const SettingsError& error) {
        m_dialogs.showMessage({ error.what(), MessageButtons::Ok, MessageIcon::Exclamation,
            std::string(kApplicationTitle), DialogAnswer::Ok });
    }
}

bool Form1::ValidateYear(TextBox which)
{
    return penmoor::ValidateYear(*this, which, m_dialogs, m_currentYear());
}

bool Form1::ValidateWeeks(TextBox which)
{
    return penmoor::ValidateWeeks(*this, which, m_dialogs);
}

bool Form1::CheckPeriodOptions()
{
    return penmoor::CheckPeriodOptions(*this, m_dialogs);
}

void Form1::replaceListEntries(std::vector<std::string> names)
{
    m_list1->replaceEntries(std::move(names));
}

int Form1::listEntryCount() const
{
    return m_list1->entryCount();
}

void Form1::setSelectedListIndex(int index)
{
    m_list1->setSelectedIndex(index);
}

int Form1::selectedListIndex() const
{
    return m_list1->selectedIndex();
}

std::string Form1::text(TextBox which) const
{
    return box(which)->text().toStdString();
}

void Form1::setText(TextBox which, std::string_view text)
{
    box(which)->setText(fromUtf8(text));
}

bool Form1::isOptionOn(OptionButton which) const
{
    return option(which)->isChecked();
}

void Form1::setOptionOn(OptionButton which, bool on)
{
    QRadioButton* radio = option(which);
    if (on) {
        radio->setChecked(true);
    } else if (radio->isChecked()) {
        // The group refuses to turn its one checked button off; the model needs a moment with
        // none on while it sets the three in turn.
        radio->setAutoExclusive(false);
        radio->setChecked(false);
        radio->setAutoExclusive(true);
    }
}

void Form1::lockDrawing()
{
    m_drawingLocked = true;
    setUpdatesEnabled(false);
}

void Form1::unlockDrawing()
{
    if (m_drawingLocked) {
        m_drawingLocked = false;
        setUpdatesEnabled(true);
    }
}

void Form1::setMousePointer(MousePointer pointer)
{
    if (pointer == m_pointer) {
        return;
    }
    if (pointer == MousePointer::Hourglass) {
        putPointersAside();
        setCursor(Qt::WaitCursor);
    } else {
        restorePointers();
        if (pointer == MousePointer::Custom) {
            setCursor(m_customPointer);
        } else {
            unsetCursor();
        }
    }
    m_pointer = pointer;
}

void Form1::putPointersAside()
{
    // The hourglass covers the whole window, buttons and boxes included.
    for (QWidget* child : findChildren<QWidget*>()) {
        if (child->window() == this && child->testAttribute(Qt::WA_SetCursor)) {
            m_pointersAside.emplace_back(child, child->cursor());
            child->unsetCursor();
        }
    }
}

void Form1::restorePointers()
{
    for (const auto& [child, pointer] : m_pointersAside) {
        if (child) {
            child->setCursor(pointer);
        }
    }
    m_pointersAside.clear();
}

void Form1::show()
{
    QWidget::show();
    raise();
    activateWindow();
}

void Form1::hide()
{
    QWidget::hide();
}

void Form1::closeEvent(QCloseEvent* event)
{
    writeSettings();
    event->accept();
    emit unloaded();
}

bool Form1::eventFilter(QObject* watched, QEvent* event)
{
    if (event->type() == QEvent::FocusOut) {
        const Qt::FocusReason reason = static_cast<QFocusEvent*>(event)->reason();
        // Only the user moving on counts; a window losing the focus, or the focus given back
        // to a box after a problem, does not.
        const bool userMovedOn = reason == Qt::MouseFocusReason || reason == Qt::TabFocusReason
            || reason == Qt::BacktabFocusReason || reason == Qt::ShortcutFocusReason;
        if (const std::optional<TextBox> left = checkedOnLeaving(watched); left && userMovedOn) {
            m_pendingCheck = left;
            QTimer::singleShot(0, this, [this] { runPendingCheck(); });
        }
    }
    return QWidget::eventFilter(watched, event);
}

std::optional<TextBox> Form1::checkedOnLeaving(const QObject* widget) const
{
    for (const TextBox checked : { TextBox::Text2, TextBox::Text3, TextBox::Text4 }) {
        if (widget == box(checked)) {
            return checked;
        }
    }
    return std::nullopt;
}

bool Form1::runPendingCheck()
{
    if (!m_pendingCheck) {
        return false;
    }
    const TextBox left = *m_pendingCheck;
    m_pendingCheck.reset();
    const bool problem = left == TextBox::Text4 ? ValidateWeeks(left) : ValidateYear(left);
    if (problem) {
        box(left)->setFocus(Qt::OtherFocusReason);
    }
    return problem;
}

void Form1::runCommand(const std::function<void()>& command)
{
    if (runPendingCheck()) {
        return;
    }
    command();
}

QLineEdit* Form1::box(TextBox which) const
{
    return m_boxes[static_cast<std::size_t>(which)];
}

QRadioButton* Form1::option(OptionButton which) const
{
    return m_optionButtons[static_cast<std::size_t>(which)];
}

} // namespace penmoor
