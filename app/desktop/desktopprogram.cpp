#include "app/desktop/desktopprogram.h"

#include "spreadsheet/picture/enginepicturerenderer.h"

#include <QCoreApplication>

namespace penmoor {

DesktopProgram::DesktopProgram(DesktopSetup setup)
    : m_spreadsheets(std::make_shared<picture::EnginePictureRenderer>())
    , m_form1({ setup.settings, setup.dialogs, m_spreadsheets, setup.programFolder, setup.currentYear,
          std::move(setup.makerPageDraw), std::move(setup.openAddress), setup.splashTime })
    , m_preview([this, &dialogs = setup.dialogs, programFolder = setup.programFolder] {
        return std::make_unique<Form2>(
            m_form1, dialogs, [this] { m_form1.writeSettings(); }, programFolder);
    })
    , m_driver({ m_spreadsheets, m_form1.options(), m_form1, std::move(setup.temporaryFolder),
                   std::move(setup.temporaryNames) },
          m_form1, m_preview, setup.dialogs)
{
    m_form1.setStartCommand([this] { m_driver.StartCreatingTemplate(); });
    QObject::connect(&m_form1, &Form1::unloaded, QCoreApplication::instance(), &QCoreApplication::quit);
}

void DesktopProgram::start()
{
    m_form1.load();
    m_form1.show();
}

} // namespace penmoor
