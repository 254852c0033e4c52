// Linked into every Qt test: one QApplication for the whole run, headless and with a fixed
// style and font resolution, so sizes are the same on every machine and no window appears.
#include <memory>

#include <QApplication>

#include <gtest/gtest.h>

namespace {

class QtEnvironment : public ::testing::Environment {
public:
    void SetUp() override
    {
        if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) {
            qputenv("QT_QPA_PLATFORM", "offscreen");
        }
        qputenv("QT_FONT_DPI", "96");
        qputenv("QT_SCALE_FACTOR", "1");
        m_application = std::make_unique<QApplication>(m_argc, m_argv);
        QApplication::setStyle(QStringLiteral("Fusion"));
    }
    void TearDown() override { m_application.reset(); }

private:
    char m_name[16] = "penmoor-test";
    char* m_argv[2] = { m_name, nullptr };
    int m_argc = 1;
    std::unique_ptr<QApplication> m_application;
};

[[maybe_unused]] ::testing::Environment* const environment = ::testing::AddGlobalTestEnvironment(new QtEnvironment);

} // namespace
