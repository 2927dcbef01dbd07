// SPDX-License-Identifier: MIT
#pragma once

#include "gui/ZtPluginInterface.h"

#include <QObject>
#include <QPointer>
#include <QString>

#include <memory>

class KvReportKernelData;
class KvReportTemplatesEditor;
class KvStatisticsWindow;
class KvToolBase;
class QSize;
class QTranslator;
class QWidget;

namespace Ui {
class GuiStatReportingPluginUi;
}

/**
 * What the host loads: one tool in its group "Statistics tools". The tool's panel keeps a short list of
 * recently used templates, makes a PDF report of the selected one, and opens the templates editor and the
 * statistics window.
 *
 * Both windows are made when they are first needed, as children of the main window, and kept hidden
 * afterwards.
 */
class StatReportingPlugin
    : public QObject
    , public ZtPluginInterface
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "StatReportingPlugin")
    Q_INTERFACES(ZtPluginInterface)

public:
    StatReportingPlugin();
    ~StatReportingPlugin() override;

    QStringList groupNames() override;
    bool initialize(const QString &groupName, KvGuiMainWindowBase *mainWindow) override;
    int order() override;

    /** Translates the panel anew when the application's language changes. */
    bool eventFilter(QObject *watched, QEvent *event) override;

public slots:
    void slotBrowseClicked();
    void slotEditorClicked();
    void slotExportClicked();
    void slotStatisticsClicked();
    void slotEditorClosed();
    void slotStatisticsClosed();
    void slotToolActivated(bool anActivated);
    void slotSaveReportTemplates();
    void slotCurrentTemplateSelected(int aIdx);

private:
    void loadTranslation();
    void installTranslation(const QString &language);
    void createTool();
    void createPanel();
    void createKernelData();
    void readTemplates();
    void connectSignals();
    void updateIcons();
    void ensureEditor();
    void closeEditor();
    QString currentTemplate() const;
    QString browseFolder() const;
    void addTemplate(int index, const QString &path);
    void useTemplate(const QString &path);
    /** Opens a template that the user gave the host: in the editor, and as the current one of the panel. */
    void openGivenTemplate(const QString &path);

    // Pointers to windows are cleared when the main window, their parent, deletes them.
    QPointer<KvReportTemplatesEditor> m_editor;
    QPointer<KvStatisticsWindow> m_statisticsWindow;
    std::unique_ptr<KvReportKernelData> m_kernelData;
    QPointer<KvGuiMainWindowBase> m_mainWindow;
    std::unique_ptr<QTranslator> m_translator; ///< installed, or the last one that could not be loaded
    QString m_currentLanguage;                 ///< of the installed translator
    std::unique_ptr<Ui::GuiStatReportingPluginUi> m_ui;
    QPointer<QWidget> m_panel; ///< holds the form's widgets; dies with the main window
    QPointer<KvToolBase> m_tool;
};
