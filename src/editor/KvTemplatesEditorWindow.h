// SPDX-License-Identifier: MIT
#pragma once

#include <QMainWindow>
#include <QMessageBox>
#include <QString>

#include <memory>

class KvBaseDisplayWidget;
class KvEditorToolsList;
class KvReportKernelData;
class KvReportPagedView;
class KvTemplateModel;
class QPushButton;

namespace Ui {
class KvTemplatesEditorWindowUi;
}

/**
 * Frameless window in which a user composes a template: a palette of blocks, switches for the page sections
 * and the selected block's options at the left, the pages at the right, and a toolbar for the template file.
 *
 * What kind of template it is, where its files are and which blocks there are is up to derived classes.
 */
class KvTemplatesEditorWindow : public QMainWindow
{
    Q_OBJECT
public:
    static constexpr int FixedWidth = 1316; ///< pages are then as wide as new templates want them

    ~KvTemplatesEditorWindow() override;

    /** Where the dialogs for template files start. */
    virtual QString templatesDirectory() const = 0;
    virtual void setTemplatesDirectory(const QString &directory) = 0;
    /** Where the dialog for printed files starts. */
    virtual QString printDirectory() const = 0;
    virtual void setPrintDirectory(const QString &directory) = 0;
    /** Of template files, without a dot. */
    virtual QString templateFileSuffix() const = 0;
    /** Translated, as file dialogs want it. */
    virtual QString templateFileFilter() const = 0;

    KvTemplateModel *templateModel() const { return m_model.get(); }
    KvReportPagedView *pagedView() const;
    /** The palette, which is the registry of block types, too. */
    KvEditorToolsList *toolsList() const;

    /** Opens a template after asking, as before closing, about changes of the present one; false when it was
     * not opened. */
    bool openTemplateFile(const QString &path);

    /** Whether the user may cancel closing a modified template; true at first. */
    bool isCloseCancellable() const { return m_closeCancellable; }
    void setCloseCancellable(bool cancellable) { m_closeCancellable = cancellable; }

signals:
    void editorClosed();

public slots:
    void slotNewTemplate();
    void slotOpenTemplate();
    bool slotSaveTemplate(); ///< whether the template was saved
    bool slotSaveTemplateAs();
    /** Asks for a file and prints the template into it; the window need not be shown. */
    void slotPrintReport();
    void slotTemplateStatusChanged(const QString &aPath, bool aModified);
    void slotEditorSelectionChanged(KvBaseDisplayWidget *aSelectedWidget);
    void slotHeaderButtonClicked(bool aChecked);
    void slotFooterButtonClicked(bool aChecked);
    void slotPageNumberButtonClicked(bool aChecked);
    void slotHeaderStateChanged(bool aEnabled);
    void slotFooterStateChanged(bool aEnabled);
    void slotPageNumberingStateChanged(bool aEnabled);

protected:
    /** \a kernelData is not owned. The palette is filled by the derived class. */
    KvTemplatesEditorWindow(const QString &baseTitle, KvReportKernelData *kernelData, QWidget *parent);

    void setBaseTitle(const QString &baseTitle);

    bool event(QEvent *event) override;
    void showEvent(QShowEvent *event) override;
    void hideEvent(QHideEvent *event) override;
    void closeEvent(QCloseEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void changeEvent(QEvent *event) override;

private slots:
    void slotListChanged();
    void slotToolActivated(const QString &aTypeName);

private:
    void setUpFrames();
    void setUpToolbar();
    void setUpPageControls();
    void setUpTabOrder();
    void moveOptionsInTabOrder(const QWidget *options);
    void retranslate();
    void connectSignals();
    void restorePlace();
    void stretchToScreen();

    QMessageBox::StandardButton askAboutChanges(QMessageBox::StandardButtons buttons);
    bool mayDiscardChanges();
    bool mayClose();
    void saveGeometryToSettings() const;
    void printTo(const QString &fileName);
    void tellPrintFailed(const QString &fileName);
    void endLiveMode();

    std::unique_ptr<Ui::KvTemplatesEditorWindowUi> m_ui;
    std::unique_ptr<KvTemplateModel> m_model;
    QPushButton *m_headerButton = nullptr;
    QPushButton *m_footerButton = nullptr;
    QPushButton *m_pageNumberButton = nullptr;
    QString m_baseTitle;
    bool m_isShown = false; ///< between show and hide; blocks then show live data
    bool m_closeCancellable = true;
};
