// SPDX-License-Identifier: MIT
#include "KvDeskActions.h"
#include "KvDeskExportDialog.h"
#include "KvDeskFirstTemplates.h"
#include "KvDeskGallery.h"
#include "KvDeskGallerySettings.h"
#include "KvDeskGalleryView.h"
#include "KvDeskGuideCommand.h"
#include "KvDeskGuideWindow.h"
#include "KvDeskImageView.h"
#include "KvDeskInlineEditor.h"
#include "KvDeskLanguages.h"
#include "KvDeskSelection.h"
#include "KvDeskSettingsDialog.h"
#include "KvDeskSourceCommands.h"
#include "KvDeskTheme.h"
#include "KvDeskToolColumn.h"
#include "KvDeskTranslation.h"
#include "ModalVisit.h"
#include "RunningDesk.h"

#include "editor/KvPrintProgressDialog.h"
#include "host/desk/RecoveryCopies.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFrameSourceCatalogue.h"
#include "support/FileDialogAnswerer.h"

#include <QAction>
#include <QButtonGroup>
#include <QDir>
#include <QFile>
#include <QMenu>
#include <QMenuBar>
#include <QMessageBox>
#include <QTemporaryDir>
#include <QtTest>

#include <cstdio>
#include <functional>
#include <set>

/**
 * Photographs every window of the Desk and of the plug-in in it, in one theme and language, into a folder of
 * PNG files.
 */
class Screenshots
{
public:
    Screenshots(const QString &examples, const QString &theme, const QString &folder, const QString &language)
        : m_examples(QDir(examples).absolutePath())
        , m_theme(theme)
        , m_folder(folder)
    {
        ZtAppSettings::getInstance()->setStoragePath(QString());
        setLanguage(language);
        m_language = language;
        KvDeskTheme::store(theme);
        KvDeskGallerySettings::setSnapshotsFolder(m_examples + QStringLiteral("/pictures"));
        KvDeskFirstTemplates::offer(m_examples + QStringLiteral("/templates"));
        m_desk = std::make_unique<RunningDesk>();
        m_desk->window()->resize(1280, 800);
    }

    void takeAll()
    {
        takeDesk();
        takeMenus();
        takeDialogs();
        takeFileDialogs();
        takeGuide();
        takeEditor();
        takeStatistics();
        takeRecovery();
    }

private:
    // As on a system in that language. The plug-in reads the setting.
    void setLanguage(const QString &language)
    {
        KvDeskLanguages::storeChoice(language);
        QLocale::setDefault(KvDeskLanguages::localeOf(language));
        m_translation = std::make_unique<KvDeskTranslation>(language);
        if (!m_translation->isLoaded())
            std::fprintf(stderr, "screenshots: there is no translation to %s\n", qPrintable(language));
    }

    static void settle() { QTest::qWait(400); }

    void take(QWidget *widget, const QString &name) const
    {
        settle();
        const QString path = QStringLiteral("%1/%2-%3.png").arg(m_folder, name, m_theme.toLower());
        if (!widget->grab().save(path))
            std::fprintf(stderr, "screenshots: %s cannot be written\n", qPrintable(path));
        std::printf("%s\n", qPrintable(path));
    }

    // Of the window that "open" runs: it is photographed and closed.
    void takeModal(const QString &name, const std::function<void()> &open) const
    {
        if (!visitModal(open, [&](QWidget *modal) { take(modal, name); }))
            std::fprintf(stderr, "screenshots: there was no window for %s\n", qPrintable(name));
    }

    QAction *action(KvDeskActions::Id id) const { return m_desk->window()->actions()->action(id); }
    KvDeskFileCommands *files() const { return m_desk->window()->files(); }
    QString session(const char *name) const
    {
        return QStringLiteral("%1/sessions/%2.json").arg(m_examples, QLatin1String(name));
    }

    void takeDesk()
    {
        KvDeskMainWindow *const window = m_desk->window();
        take(window, QStringLiteral("desk-start"));
        window->resize(800, 520);
        take(window, QStringLiteral("desk-start-small"));
        window->resize(1280, 800);
        // Before there are objects: then nothing asks to be saved.
        window->sources()->open(ZtFrameSourceCatalogue::infoOfPath(m_examples + QStringLiteral("/pictures")));
        take(window, QStringLiteral("desk-live"));
        for (const char *const name : {"coin", "cells", "fibres", "demo"}) {
            files()->openCopy(session(name));
            take(window, QStringLiteral("desk-%1").arg(QLatin1String(name)));
        }
        window->selection()->select({ZtDrawnType::Line, 2});
        take(window, QStringLiteral("desk-selected"));
        window->activateWindow();
        window->imageView()->setFocus();
        action(KvDeskActions::Rename)->trigger();
        take(window, QStringLiteral("desk-renaming"));
        window->imageView()->inlineEditor()->slotCancel();
        action(KvDeskActions::StartPage)->trigger();
        take(window, QStringLiteral("desk-start-over-image"));
        action(KvDeskActions::CounterTool)->trigger();
        take(window, QStringLiteral("desk-counter-tool"));
        action(KvDeskActions::ShowGallery)->trigger();
        action(KvDeskActions::ShowLog)->trigger();
        take(window, QStringLiteral("desk-gallery-and-log"));
        action(KvDeskActions::ShowGallery)->trigger();
        action(KvDeskActions::ShowLog)->trigger();
        action(KvDeskActions::SelectTool)->trigger();
        take(m_desk->window()->toolColumn(), QStringLiteral("panel-report"));
    }

    void takeMenus() const
    {
        QMenuBar *const bar = m_desk->window()->menuBar();
        int count = 0;
        for (const QAction *const entry : bar->actions()) {
            if (!entry->menu())
                continue;
            entry->menu()->popup(
                bar->mapToGlobal(bar->actionGeometry(const_cast<QAction *>(entry)).bottomLeft()));
            take(entry->menu(), QStringLiteral("menu-%1").arg(++count));
            entry->menu()->close();
        }
    }

    void takeFileDialogs() const
    {
        const QVector<QPair<KvDeskActions::Id, QString>> dialogs{
            {KvDeskActions::OpenImage, QStringLiteral("open-image")},
            {KvDeskActions::OpenSession, QStringLiteral("open-session")},
            {KvDeskActions::ImportTable, QStringLiteral("import-table")},
            {KvDeskActions::SaveSessionAs, QStringLiteral("save-session")}};
        for (const auto &dialog : dialogs)
            takeModal(QStringLiteral("dialog-") + dialog.second,
                      [this, &dialog]() { action(dialog.first)->trigger(); });
    }

    // At its beginning and further down.
    void takeGuide() const
    {
        KvDeskGuideWindow guide(KvDeskGuideCommand::guide(m_language));
        guide.resize(1024, 768);
        guide.show();
        take(&guide, QStringLiteral("guide"));
        guide.contents()->setCurrentRow(guide.contents()->count() - 2);
        QTest::keyClick(guide.contents(), Qt::Key_Return);
        take(&guide, QStringLiteral("guide-end"));
    }

    void takeRecovery() const
    {
        RecoveryCopies::add(m_copies.path(), QStringLiteral("a"), 2, 90);
        RecoveryCopies::add(m_copies.path(), QStringLiteral("b"), 2, 9000);
        m_desk->window()->startRecovery(m_copies.path());
        take(m_desk->window(), QStringLiteral("desk-recovery"));
    }

    void takeDialogs()
    {
        KvDeskSettingsDialog settings(m_desk->window());
        takeDialog(&settings, "dialog-settings");
        KvDeskExportDialog table({}, m_desk->window());
        takeDialog(&table, "dialog-export");
        takeMessages();
        takeModal(QStringLiteral("dialog-about"), [this]() { action(KvDeskActions::About)->trigger(); });
        action(KvDeskActions::Calibrate)->trigger();
        for (QWidget *const widget : QApplication::topLevelWidgets()) {
            if (!widget->inherits("KvDeskCalibrationDialog"))
                continue;
            int count = 0;
            for (QAbstractButton *const way : widget->findChild<QButtonGroup *>()->buttons()) {
                way->click();
                take(widget, QStringLiteral("dialog-calibration-%1").arg(++count));
            }
            widget->close();
        }
    }

    void takeMessages() const
    {
        const char context[] = "KvDeskFileCommands";
        const QString title = QCoreApplication::translate(context, "Unsaved changes");
        const QString text = QCoreApplication::translate(context, "Save the changes to \"%1\"?");
        for (const auto icon :
             {QMessageBox::Question, QMessageBox::Information, QMessageBox::Warning, QMessageBox::Critical}) {
            QMessageBox box(icon, title, text.arg(QStringLiteral("plate.json")),
                            QMessageBox::Save | QMessageBox::Discard | QMessageBox::Cancel, m_desk->window());
            takeDialog(&box, qPrintable(QStringLiteral("dialog-message-%1").arg(icon)));
        }
    }

    void takeDialog(QDialog *dialog, const char *name) const
    {
        dialog->show();
        take(dialog, QLatin1String(name));
        dialog->close();
    }

    void takeEditor()
    {
        m_desk->button("theEditorButton")->click();
        QWidget *const editor = m_desk->editor();
        editor->resize(1280, 800);
        take(editor, QStringLiteral("editor-empty"));
        {
            const FileDialogAnswerer answerer(m_examples + QStringLiteral("/templates/every-block.rtp"));
            editor->activateWindow();
            QTest::keyClick(editor, Qt::Key_O, Qt::ControlModifier);
            take(editor, QStringLiteral("editor-every-block"));
        }
        takeOptions(editor);
        takeByKey(editor, QStringLiteral("dialog-save-template"), Qt::Key_S,
                  Qt::ControlModifier | Qt::ShiftModifier);
        takeByKey(editor, QStringLiteral("dialog-open-template"), Qt::Key_O, Qt::ControlModifier);
        KvPrintProgressDialog printing(editor, 0);
        printing.pageWritten(1, 4);
        take(&printing, QStringLiteral("dialog-printing"));
        printing.close();
        editor->close();
    }

    void takeByKey(QWidget *window, const QString &name, Qt::Key key, Qt::KeyboardModifiers modifiers) const
    {
        window->activateWindow();
        settle();
        takeModal(name, [=]() { QTest::keyClick(window, key, modifiers); });
    }

    // Of each type of block the first.
    void takeOptions(QWidget *editor) const
    {
        std::set<QString> seen;
        const QStringList classes = m_desk->pieceClasses();
        for (int i = 0; i < classes.size(); ++i) {
            if (!seen.insert(classes.at(i)).second)
                continue;
            QGraphicsProxyWidget *const piece = m_desk->pieces().at(i);
            m_desk->pages()->centerOn(piece);
            settle();
            QTest::mouseClick(m_desk->pages()->viewport(), Qt::LeftButton, Qt::NoModifier,
                              m_desk->pages()->mapFromScene(m_desk->centerOf(piece)));
            take(editor, QStringLiteral("editor-options-%1").arg(classes.at(i)));
            takeOptionsDialogs();
        }
    }

    // Of a text: its link and its picture.
    void takeOptionsDialogs() const
    {
        if (!m_desk->options() || !m_desk->options()->inherits("KvTextDocumentNodeOptionsWidget"))
            return;
        for (const char *const slot : {"slotLinkClicked", "slotGalleryClicked"})
            takeModal(QStringLiteral("dialog-text-") + QString::fromLatin1(slot).mid(4, 4).toLower(),
                      [this, slot]() { QMetaObject::invokeMethod(m_desk->options(), slot); });
    }

    void takeStatistics()
    {
        files()->openCopy(session("fibres"));
        m_desk->button("theStatisticsButton")->click();
        QWidget *const window = m_desk->statisticsWindow();
        window->resize(1280, 800);
        // Collected first: showing another chart deletes what belonged to the one before.
        QList<QWidget *> buttons;
        for (QWidget *const widget : window->findChildren<QWidget *>()) {
            if (widget->inherits("KvStatisticsToolIconButton"))
                buttons.append(widget);
        }
        for (int i = 0; i < buttons.size(); ++i) {
            QTest::mouseClick(buttons.at(i), Qt::LeftButton);
            take(window, QStringLiteral("statistics-%1").arg(i + 1));
        }
        window->close();
    }

    QString m_examples;
    QString m_theme;
    QString m_folder;
    QString m_language;
    QTemporaryDir m_copies; ///< what a program left that did not end in order; the Desk holds locks in it
    std::unique_ptr<KvDeskTranslation> m_translation;
    std::unique_ptr<RunningDesk> m_desk;
};

int main(int argc, char **argv)
{
    if (argc < 4 || argc > 6) {
        std::fputs("Usage: Screenshots EXAMPLES Dark|Light FOLDER [LANGUAGE [SCALE]]\n", stderr);
        return 2;
    }
    if (argc == 6)
        qputenv("QT_SCALE_FACTOR", argv[5]);
    QCoreApplication::setAttribute(Qt::AA_Use96Dpi);
    QCoreApplication::setAttribute(Qt::AA_EnableHighDpiScaling);
    QCoreApplication::setAttribute(Qt::AA_UseHighDpiPixmaps);
    const QApplication application(argc, argv);
    ZtAppSettings::setProgramInfo(QStringLiteral("Measuring Desk"), QStringLiteral(STATREPORT_VERSION),
                                  QStringLiteral(STATREPORT_VENDOR));
    const QString folder = QString::fromLocal8Bit(argv[3]);
    QDir().mkpath(folder);
    const QString language = argc >= 5 ? QString::fromLocal8Bit(argv[4]) : QStringLiteral("English");
    Screenshots(QString::fromLocal8Bit(argv[1]), QString::fromLocal8Bit(argv[2]), folder, language).takeAll();
    return 0;
}
