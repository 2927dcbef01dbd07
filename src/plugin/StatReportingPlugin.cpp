// SPDX-License-Identifier: MIT
#include "plugin/StatReportingPlugin.h"

#include "common/ZtAppStatus.h"
#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"
#include "editor/KvReportTemplatesEditor.h"
#include "gui/KvGuiMainWindowBase.h"
#include "gui/KvToolBase.h"
#include "gui/QtAdvancedStylesheet.h"
#include "gui/acss.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtLeftToRight.h"
#include "kernel/ZtSignalCenter.h"
#include "resources/KvReportResources.h"
#include "statistics/KvStatisticsWindow.h"
#include "templates/KvTemplateModel.h"
#include "ui_GuiStatReportingPluginUi.h"

#include <QCoreApplication>
#include <QEvent>
#include <QFileDialog>
#include <QFileInfo>
#include <QSignalBlocker>
#include <QTranslator>

namespace {

constexpr int kOrder = 75;
constexpr int kMostTemplates = 5;
constexpr int kIconMode = 6;
const QSize kIconSize(32, 24);

const QString kToolGroup = QStringLiteral("Statistics tools");
const QString kToolIcon = QStringLiteral("Icons/statreport");
const QString kSettingsGroup = QStringLiteral("StatReporting");
const QString kTemplatesKey = QStringLiteral("ReportTemplatePaths");
const QString kCurrentTemplateKey = QStringLiteral("CurrentReportTemplate");
const QString kSystemLanguage = QStringLiteral("auto");

QIcon icon(const QString &path)
{
    return acss::createIcon(kIconMode, path, kIconSize);
}

QString languageSetting()
{
    const QString language = ZtAppSettings::value(QStringLiteral("GEN_Language"), kSystemLanguage).toString();
    return language == kSystemLanguage ? ZtAppSettings::getSystemLanguageName() : language;
}

} // namespace

StatReportingPlugin::StatReportingPlugin() = default;

StatReportingPlugin::~StatReportingPlugin()
{
    // The windows outlive the data that they show; they know that it may be gone.
    m_kernelData.reset();
    // A host may leave its windows to the end of the program; no widget can be deleted without an
    // application.
    if (!QCoreApplication::instance())
        return;
    delete m_editor;
    delete m_statisticsWindow;
}

QStringList StatReportingPlugin::groupNames()
{
    return {kToolGroup};
}

int StatReportingPlugin::order()
{
    return kOrder;
}

bool StatReportingPlugin::initialize(const QString &groupName, KvGuiMainWindowBase *mainWindow)
{
    if (groupName != kToolGroup)
        return false;

    KvReportResources::ensure();
    m_mainWindow = mainWindow;
    loadTranslation();
    createTool();
    readTemplates();
    createKernelData();
    connectSignals();
    return true;
}

void StatReportingPlugin::loadTranslation()
{
    const QString language = languageSetting();
    if (language.compare(m_currentLanguage, Qt::CaseInsensitive) != 0)
        installTranslation(language);
}

void StatReportingPlugin::installTranslation(const QString &language)
{
    if (m_translator)
        QCoreApplication::removeTranslator(m_translator.get());
    m_translator = std::make_unique<QTranslator>();
    if (!m_translator->load(QStringLiteral(":/statreportingplugin/%1.qm").arg(language)))
        return;
    QCoreApplication::installTranslator(m_translator.get());
    m_currentLanguage = language;
}

void StatReportingPlugin::createTool()
{
    m_tool = new KvToolBase(m_mainWindow, icon(kToolIcon), tr("Statistics tools"),
                            QStringLiteral("statreport"), false);
    m_tool->setResetVisible(false);
    m_tool->setFileSuffixes({QStringLiteral("rtp")});
    createPanel();
    m_tool->setGuiWidget(m_panel);
    m_tool->setEnabled(true, false);
}

void StatReportingPlugin::createPanel()
{
    m_panel = new QWidget;
    m_ui = std::make_unique<Ui::GuiStatReportingPluginUi>();
    m_ui->setupUi(m_panel);
    m_panel->installEventFilter(this);
    for (QToolButton *button :
         {m_ui->theBrowseButton, m_ui->theEditorButton, m_ui->theExportButton, m_ui->theStatisticsButton}) {
        button->setIconSize(kIconSize);
        button->setFixedSize(kIconSize);
    }
    updateIcons();
}

void StatReportingPlugin::updateIcons()
{
    if (!m_panel)
        return;
    m_tool->setToolIcon(icon(kToolIcon));
    m_ui->theBrowseButton->setIcon(icon(QStringLiteral("Icons/browse")));
    m_ui->theEditorButton->setIcon(icon(QStringLiteral("Icons/editor")));
    m_ui->theExportButton->setIcon(icon(QStringLiteral("Icons/export-pdf")));
    m_ui->theStatisticsButton->setIcon(icon(QStringLiteral("Icons/statwin")));
}

void StatReportingPlugin::readTemplates()
{
    ZtAppSettings::beginGroup(kSettingsGroup);
    const QStringList paths = ZtAppSettings::value(kTemplatesKey).toStringList();
    ZtAppSettings::endGroup();
    // The first one becomes current, whichever was current when the list was written: the list is in the
    // order of use.
    for (const QString &path : paths) {
        if (QFileInfo::exists(path))
            addTemplate(m_ui->theTemplatePath->count(), path);
    }
    slotCurrentTemplateSelected(m_ui->theTemplatePath->currentIndex());
}

void StatReportingPlugin::createKernelData()
{
    if (!m_kernelData)
        m_kernelData = std::make_unique<KvReportKernelData>();
    KvStatisticsEngine::instance().setKernelData(m_kernelData.get());
}

void StatReportingPlugin::connectSignals()
{
    connect(m_ui->theBrowseButton, SIGNAL(clicked()), this, SLOT(slotBrowseClicked()));
    connect(m_ui->theEditorButton, SIGNAL(clicked()), this, SLOT(slotEditorClicked()));
    connect(m_ui->theExportButton, SIGNAL(clicked()), this, SLOT(slotExportClicked()));
    connect(m_ui->theStatisticsButton, SIGNAL(clicked()), this, SLOT(slotStatisticsClicked()));
    connect(m_tool, SIGNAL(toolActivated(bool)), this, SLOT(slotToolActivated(bool)));
    connect(m_tool, &KvToolBase::fileGiven, this, &StatReportingPlugin::openGivenTemplate);
    connect(m_ui->theTemplatePath, SIGNAL(currentIndexChanged(int)), this,
                                          SLOT(slotCurrentTemplateSelected(int)));
    connect(ZtSignalCenter::getInstance(), SIGNAL(signalAppAboutToClose()), this,
                                                  SLOT(slotSaveReportTemplates()), Qt::UniqueConnection);
    connect(acss::QtAdvancedStylesheet::getInstance(), &acss::QtAdvancedStylesheet::currentThemeChanged, this,
            &StatReportingPlugin::updateIcons, Qt::UniqueConnection);
}

bool StatReportingPlugin::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == m_panel && event->type() == QEvent::LanguageChange)
        m_ui->retranslateUi(m_panel);
    return QObject::eventFilter(watched, event);
}

QString StatReportingPlugin::currentTemplate() const
{
    return m_ui->theTemplatePath->currentData().toString();
}

void StatReportingPlugin::addTemplate(int index, const QString &path)
{
    const QFileInfo file(path);
    m_ui->theTemplatePath->insertItem(index, file.fileName(), file.absoluteFilePath());
    m_ui->theTemplatePath->setItemData(index, ZtLeftToRight::isolated(file.absoluteFilePath()),
                                       Qt::ToolTipRole);
}

QString StatReportingPlugin::browseFolder() const
{
    const QFileInfo current(currentTemplate());
    return current.exists() ? current.absolutePath() : m_editor->templatesDirectory();
}

void StatReportingPlugin::slotBrowseClicked()
{
    if (!m_panel)
        return;
    ensureEditor();
    const QString path = QFileDialog::getOpenFileName(nullptr, tr("Select Template File"), browseFolder(),
                                                      tr("Report Template File (*.rtp)"), nullptr,
                                                      QFileDialog::DontUseNativeDialog);
    if (m_panel && !path.isEmpty() && path != currentTemplate())
        useTemplate(path);
}

void StatReportingPlugin::useTemplate(const QString &path)
{
    QComboBox *list = m_ui->theTemplatePath;
    const int known = list->findData(path);
    if (known >= 0)
        list->removeItem(known);
    addTemplate(0, path);
    list->setCurrentIndex(0); // the item that was current has moved down and would stay current
    slotCurrentTemplateSelected(0);
    if (list->count() > kMostTemplates)
        list->removeItem(list->count() - 1);
}

void StatReportingPlugin::slotCurrentTemplateSelected(int aIdx)
{
    Q_UNUSED(aIdx)
    if (m_panel)
        m_ui->theTemplatePath->setToolTip(currentTemplate());
}

void StatReportingPlugin::ensureEditor()
{
    if (m_editor)
        return;
    m_editor = new KvReportTemplatesEditor(m_kernelData.get(), m_mainWindow);
    connect(m_editor, SIGNAL(editorClosed()), this, SLOT(slotEditorClosed()));
}

void StatReportingPlugin::slotEditorClicked()
{
    if (!m_panel)
        return;
    if (!m_ui->theEditorButton->isChecked()) {
        closeEditor();
        return;
    }
    ensureEditor();
    m_editor->templateModel()->newTemplate();
    m_editor->show();
}

void StatReportingPlugin::openGivenTemplate(const QString &path)
{
    if (!m_panel)
        return;
    ensureEditor();
    if (!m_editor->isVisible())
        m_editor->templateModel()->newTemplate();
    m_editor->show();
    m_editor->raise();
    m_editor->activateWindow();
    m_ui->theEditorButton->setChecked(true);
    const QString file = QFileInfo(path).absoluteFilePath();
    if (m_editor->openTemplateFile(file) && m_panel && file != currentTemplate())
        useTemplate(file);
}

void StatReportingPlugin::closeEditor()
{
    if (m_editor)
        m_editor->close();
    if (!m_editor || !m_editor->isVisible())
        return;
    // The user kept it open when asked about the changes.
    const QSignalBlocker blocker(m_ui->theEditorButton);
    m_ui->theEditorButton->setChecked(true);
}

void StatReportingPlugin::slotEditorClosed()
{
    if (m_panel)
        m_ui->theEditorButton->setChecked(false);
}

void StatReportingPlugin::slotExportClicked()
{
    if (!m_panel)
        return;
    if (m_ui->theTemplatePath->currentText().isEmpty()) {
        ZtAppStatus status(ZtAppStatus::Warning, 0);
        status.setPreferredDestination(ZtAppStatus::StatusPanel);
        status.setAndLogStatus(ZtAppStatus::Warning, 0, tr("No report template selected."),
                               QStringLiteral("StatReportingPlugin::slotExportClicked"));
        return;
    }
    ensureEditor();
    if (m_editor->templateModel()->load(currentTemplate()))
        m_editor->slotPrintReport();
}

void StatReportingPlugin::slotStatisticsClicked()
{
    if (!m_panel)
        return;
    if (!m_ui->theStatisticsButton->isChecked()) {
        if (m_statisticsWindow)
            m_statisticsWindow->close();
        return;
    }
    if (!m_statisticsWindow) {
        m_statisticsWindow = new KvStatisticsWindow(m_kernelData.get(), m_mainWindow);
        connect(m_statisticsWindow, SIGNAL(windowClosed()), this, SLOT(slotStatisticsClosed()));
    }
    m_statisticsWindow->show();
}

void StatReportingPlugin::slotStatisticsClosed()
{
    if (m_panel)
        m_ui->theStatisticsButton->setChecked(false);
}

void StatReportingPlugin::slotToolActivated(bool anActivated)
{
    if (anActivated)
        return;
    if (m_editor && m_editor->isVisible()) {
        // The tool is gone whatever the user answers, so this question offers no way back.
        m_editor->setCloseCancellable(false);
        m_editor->close();
        if (m_editor)
            m_editor->setCloseCancellable(true);
    }
    if (m_statisticsWindow && m_statisticsWindow->isVisible())
        m_statisticsWindow->close();
}

void StatReportingPlugin::slotSaveReportTemplates()
{
    if (!m_panel)
        return;
    QStringList paths;
    for (int i = 0; i < m_ui->theTemplatePath->count(); ++i)
        paths.append(m_ui->theTemplatePath->itemData(i).toString());
    ZtAppSettings::beginGroup(kSettingsGroup);
    ZtAppSettings::setValue(kTemplatesKey, paths);
    ZtAppSettings::setValue(kCurrentTemplateKey, currentTemplate());
    ZtAppSettings::endGroup();
}
