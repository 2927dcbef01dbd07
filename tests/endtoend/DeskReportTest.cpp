// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "DeskUser.h"
#include "RunningDesk.h"
#include "common/ZtAppStatus.h"
#include "gui/KvToolBase.h"
#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtSignalCenter.h"
#include "report/PdfFile.h"
#include "support/FileDialogAnswerer.h"
#include "support/MessageBoxAnswerer.h"

#include <QDate>
#include <QDragEnterEvent>
#include <QDropEvent>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QMimeData>
#include <QTranslator>
#include <QUrl>

namespace {

QJsonObject readJson(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? QJsonDocument::fromJson(file.readAll()).object() : QJsonObject();
}

/** A template without what differs from one run to the next: the order of the names in "columns". */
QJsonObject comparable(QJsonObject root)
{
    QJsonArray nodes = root.value(QStringLiteral("nodes")).toArray();
    for (int i = 0; i < nodes.size(); ++i) {
        QJsonObject node = nodes.at(i).toObject();
        QJsonObject config = node.value(QStringLiteral("config")).toObject();
        if (config.contains(QStringLiteral("columns"))) {
            QStringList columns = config.value(QStringLiteral("columns")).toString().split(QLatin1Char(';'));
            columns.sort();
            config[QStringLiteral("columns")] = columns.join(QLatin1Char(';'));
        }
        node[QStringLiteral("config")] = config;
        nodes[i] = node;
    }
    root[QStringLiteral("nodes")] = nodes;
    return root;
}

QStringList blockNames(const QString &path)
{
    QStringList names;
    for (const QJsonValue &node : readJson(path).value(QStringLiteral("nodes")).toArray())
        names.append(node.toObject().value(QStringLiteral("name")).toString());
    return names;
}

void writeFile(const QString &path, const QByteArray &bytes)
{
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    QCOMPARE(file.write(bytes), qint64(bytes.size()));
}

} // namespace

/**
 * Uses the built plug-in in the Measuring Desk as a person would: runs off-screen and, with real mouse and
 * keys, under an X server of its own.
 */
class DeskReportTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void findsThePlugin();
    void composesSavesReopensAndPrints();
    void movesAndDeletesBlocks();
    void headerFooterAndPageNumbers();
    void keywordsStayPlaceholders();
    void galleryImages();
    void clearAsks_data();
    void clearAsks();
    void closeAsks_data();
    void closeAsks();
    void deactivatingTheToolAsks_data();
    void deactivatingTheToolAsks();
    void tellsWhatFailed();
    void exportsFromThePanel_data();
    void exportsFromThePanel();
    void keepsTheRecentTemplates();
    void themeAndLanguageChangeWhileAllIsOpen();
    void pluginDiesWithItsWindowsOpen();
    void programEndsWithItsWindowsOpen();

private:
    void openEditor();
    void compose();
    void addText(const QString &text);
    void waitForPieces(int count);
    void modify();
    QString title() const { return m_desk->editor()->windowTitle(); }

    std::unique_ptr<RunningDesk> m_desk;
    DeskUser m_user;
};

void DeskReportTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    m_desk = std::make_unique<RunningDesk>();
    QVERIFY(QTest::qWaitForWindowExposed(m_desk->window()));
    m_user.activate(m_desk->window());
    QVERIFY(
        m_desk->window()->files()->openSession(sourcePath(QStringLiteral("examples/sessions/demo.json"))));
}

void DeskReportTest::cleanup()
{
    m_desk.reset();
    StatReportTest::cleanup();
}

void DeskReportTest::openEditor()
{
    m_user.click(m_desk->button("theEditorButton"));
    QTRY_VERIFY(m_desk->editor() && m_desk->editor()->isVisible());
    QVERIFY(QTest::qWaitForWindowExposed(m_desk->editor()));
    m_user.activate(m_desk->editor());
    QVERIFY(m_desk->pages());
}

void DeskReportTest::waitForPieces(int count)
{
    QTRY_VERIFY2(m_desk->pieces().size() >= count, qPrintable(m_desk->pieceClasses().join(QLatin1Char(' '))));
}

// Drags every block of the palette onto the top of the page, the last one first.
void DeskReportTest::compose()
{
    const QList<QWidget *> palette = m_desk->palette();
    QCOMPARE(palette.size(), 8);
    if (!palette.last()->isVisible())
        m_user.click(m_desk->paletteGroup(), QPoint(40, 12));
    QTRY_VERIFY(palette.last()->isVisible());
    int blocks = 0;
    for (int i = palette.size() - 1; i >= 0; --i) {
        QWidget *viewport = m_desk->pages()->viewport();
        m_user.drag(palette.at(i), palette.at(i)->rect().center(), viewport, QPoint(300, 46));
        waitForPieces(++blocks);
        if (QTest::currentTestFailed())
            return;
    }
    QTRY_VERIFY(m_desk->pieces().size() >= palette.size());
}

void DeskReportTest::addText(const QString &text)
{
    QWidget *viewport = m_desk->pages()->viewport();
    QWidget *tool = m_desk->palette().at(2);
    const int before = m_desk->pieces().size();
    m_user.drag(tool, tool->rect().center(), viewport, QPoint(300, 46));
    waitForPieces(before + 1);
    QTRY_VERIFY(m_desk->options());
    m_user.type(text);
    QTRY_COMPARE(RunningDesk::textIn(m_desk->pieces().first())->toPlainText(), text);
}

void DeskReportTest::modify()
{
    addText(QStringLiteral("changed"));
    QVERIFY(title().contains(QLatin1Char('*')));
}

void DeskReportTest::findsThePlugin()
{
    QCOMPARE(m_desk->pluginCount(), 1);
    QVERIFY(m_desk->tool());
    QVERIFY(m_desk->tool()->isActivated());
    for (const char *name :
         {"theEditorButton", "theExportButton", "theBrowseButton", "theStatisticsButton"}) {
        QVERIFY2(m_desk->button(name), name);
        QVERIFY2(m_desk->button(name)->isVisible(), name);
        QCOMPARE(m_desk->button(name)->size(), QSize(32, 24));
        QVERIFY2(!m_desk->button(name)->icon().isNull(), name);
    }
    QVERIFY(m_desk->templates()->isVisible());
}

void DeskReportTest::composesSavesReopensAndPrints()
{
    openEditor();
    QCOMPARE(title(), QStringLiteral("Report template editor - [new]"));
    compose();
    QTRY_COMPARE(title(), QStringLiteral("Report template editor - *[new]"));
    addText(QStringLiteral("Typed by hand"));

    const QString first = temporaryPath(QStringLiteral("composed.rtp"));
    const QString second = temporaryPath(QStringLiteral("again.rtp"));
    const FileDialogAnswerer dialogs({temporaryPath(QStringLiteral("composed")), first, second,
                                      temporaryPath(QStringLiteral("composed"))});
    m_user.press(Qt::Key_S, Qt::ControlModifier);
    QTRY_COMPARE(title(), QStringLiteral("Report template editor - ") + first);
    QCOMPARE(
        blockNames(first),
        QStringList({QStringLiteral("Text Document"), QStringLiteral("Image View"),
                     QStringLiteral("Camera Image View"), QStringLiteral("Text Document"),
                     QStringLiteral("Measurement table"), QStringLiteral("Statistics Table"),
                     QStringLiteral("MinMedMaxBox"), QStringLiteral("Trend"), QStringLiteral("Counters")}));

    m_user.press(Qt::Key_N, Qt::ControlModifier);
    QTRY_COMPARE(m_desk->pieces().size(), 0);
    m_user.press(Qt::Key_O, Qt::ControlModifier);
    QTRY_VERIFY(m_desk->pieces().size() >= 5);
    QCOMPARE(RunningDesk::textIn(m_desk->pieces().first())->toPlainText(), QStringLiteral("Typed by hand"));
    m_user.press(Qt::Key_S, Qt::ControlModifier | Qt::ShiftModifier);
    QTRY_COMPARE(title(), QStringLiteral("Report template editor - ") + second);
    QCOMPARE(comparable(readJson(second)), comparable(readJson(first)));

    m_user.press(Qt::Key_P, Qt::ControlModifier);
    const QString pdf = temporaryPath(QStringLiteral("composed.pdf"));
    QTRY_COMPARE(dialogs.dialogs().size(), 4);
    QTRY_VERIFY(PdfFile(pdf).isSound());
    const QString text = PdfFile(pdf).pageTexts().join(QLatin1Char('\n'));
    for (const char *word : {"Typed by hand", "Circle 15", "519616.6", "Rectangle 1"})
        QVERIFY2(text.contains(QLatin1String(word)), word);
    QVERIFY(!PdfFile(pdf).pictures().isEmpty());
    // The pages have their blocks back.
    QVERIFY(m_desk->pieces().size() >= 5);
    QVERIFY(RunningDesk::textIn(m_desk->pieces().first())->isVisible());
}

void DeskReportTest::movesAndDeletesBlocks()
{
    openEditor();
    addText(QStringLiteral("second"));
    m_user.press(Qt::Key_Escape);
    QTRY_VERIFY(!m_desk->options());
    addText(QStringLiteral("first"));
    m_user.press(Qt::Key_Escape);
    QTRY_VERIFY(!m_desk->options());

    // By its margin, above the other one.
    QGraphicsView *view = m_desk->pages();
    const QRectF secondRect(m_desk->pieces().at(1)->scenePos(), m_desk->pieces().at(1)->size());
    const QPoint start = view->mapFromScene(secondRect.topLeft() + QPointF(30, secondRect.height() / 2));
    m_user.drag(view->viewport(), start, view->viewport(), QPoint(300, 44));
    QTRY_COMPARE(m_desk->pieces().size(), 2);
    QTRY_COMPARE(RunningDesk::textIn(m_desk->pieces().at(0))->toPlainText(), QStringLiteral("second"));
    QCOMPARE(RunningDesk::textIn(m_desk->pieces().at(1))->toPlainText(), QStringLiteral("first"));

    // By its button, by the key.
    m_user.clickScene(view, m_desk->centerOf(m_desk->pieces().at(1)));
    QTRY_VERIFY(m_desk->options());
    const QRectF rect(m_desk->pieces().at(1)->scenePos(), m_desk->pieces().at(1)->size());
    m_user.clickScene(view, QPointF(rect.right() - 21, rect.center().y()));
    QTRY_COMPARE(m_desk->pieces().size(), 1);
    QWidget *image = m_desk->palette().at(0);
    m_user.drag(image, image->rect().center(), view->viewport(), QPoint(300, 400));
    waitForPieces(2);
    QTRY_VERIFY(m_desk->options());
    m_user.press(Qt::Key_Delete);
    QTRY_COMPARE(m_desk->pieces().size(), 1);
    QTRY_VERIFY(!m_desk->options());
    QCOMPARE(RunningDesk::textIn(m_desk->pieces().at(0))->toPlainText(), QStringLiteral("second"));
}

void DeskReportTest::headerFooterAndPageNumbers()
{
    openEditor();
    for (const char *name : {"headerButton", "footerButton", "pageNumberButton"}) {
        m_user.click(m_desk->editorButton(name));
        QTRY_VERIFY(m_desk->editorButton(name)->isChecked());
    }
    QTRY_VERIFY(title().contains(QLatin1Char('*')));
    QGraphicsView *view = m_desk->pages();
    const auto header = [this]() -> QTextEdit * {
        for (QGraphicsItem *item : m_desk->pages()->scene()->items()) {
            auto *proxy = qgraphicsitem_cast<QGraphicsProxyWidget *>(item);
            if (proxy && proxy->widget() && proxy->widget()->inherits("KvHeaderWidget"))
                return qobject_cast<QTextEdit *>(proxy->widget());
        }
        return nullptr;
    };
    QTRY_VERIFY(header());
    m_user.clickScene(view, header()->graphicsProxyWidget()->scenePos() + QPointF(50, 8));
    QTRY_VERIFY(m_desk->options());
    m_user.type(QStringLiteral("Laboratory 7"));
    QTRY_COMPARE(header()->toPlainText(), QStringLiteral("Laboratory 7"));

    const QString path = temporaryPath(QStringLiteral("sections.rtp"));
    const FileDialogAnswerer dialogs({path});
    m_user.press(Qt::Key_S, Qt::ControlModifier);
    QTRY_VERIFY(QFile::exists(path));
    const QJsonObject section = readJson(path).value(QStringLiteral("header")).toObject();
    QCOMPARE(section.value(QStringLiteral("enabled")), QJsonValue(true));
    QVERIFY(section.value(QStringLiteral("text")).toString().contains(QStringLiteral("Laboratory 7")));
}

void DeskReportTest::keywordsStayPlaceholders()
{
    openEditor();
    addText(QStringLiteral("Made by ${PROGRAM_NAME}"));
    m_user.press(Qt::Key_Escape);
    const QString shown = QStringLiteral("Made by ") + ZtAppSettings::getProgramName();
    QTRY_COMPARE(RunningDesk::textIn(m_desk->pieces().first())->toPlainText(), shown);
    const QString path = temporaryPath(QStringLiteral("keywords.rtp"));
    const FileDialogAnswerer dialogs({path});
    m_user.click(m_desk->editorButton("saveButton"));
    QTRY_VERIFY(QFile::exists(path));
    QFile file(path);
    QVERIFY(file.open(QIODevice::ReadOnly));
    QVERIFY(file.readAll().contains("Made by ${PROGRAM_NAME}"));
    m_user.clickScene(m_desk->pages(), m_desk->centerOf(m_desk->pieces().first()));
    QTRY_COMPARE(RunningDesk::textIn(m_desk->pieces().first())->toPlainText(),
                 QStringLiteral("Made by ${PROGRAM_NAME}"));
}

void DeskReportTest::galleryImages()
{
    openEditor();
    QMimeData data;
    data.setData(QStringLiteral("GalleryDrag"), QByteArray());
    data.setUrls({QUrl::fromLocalFile(sourcePath(QStringLiteral("examples/pictures/plate.png")))});
    QWidget *viewport = m_desk->pages()->viewport();
    const QPoint place(300, 300);
    QDragEnterEvent enter(place, Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(viewport, &enter);
    QVERIFY(enter.isAccepted());
    QDropEvent drop(place, Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(viewport, &drop);
    QTRY_COMPARE(m_desk->pieceClasses(), QStringList(QStringLiteral("KvImageWidget")));
    QVERIFY(m_desk->options());
    QVERIFY(m_desk->pieces().first()->size().height() > 300);
}

void DeskReportTest::clearAsks_data()
{
    QTest::addColumn<int>("answer");
    QTest::addColumn<bool>("saves");
    QTest::addColumn<bool>("clears");
    QTest::newRow("no") << int(QMessageBox::No) << false << true;
    QTest::newRow("yes, saved") << int(QMessageBox::Yes) << true << true;
    QTest::newRow("yes, then no file") << int(QMessageBox::Yes) << false << false;
}

void DeskReportTest::clearAsks()
{
    QFETCH(int, answer);
    QFETCH(bool, saves);
    QFETCH(bool, clears);
    openEditor();
    modify();
    const QString path = temporaryPath(QStringLiteral("clear.rtp"));
    QFile::remove(path);
    const MessageBoxAnswerer boxes(static_cast<QMessageBox::StandardButton>(answer));
    const FileDialogAnswerer dialogs(saves ? QStringList(path) : QStringList());
    m_user.click(m_desk->editorButton("clearButton"));
    QTRY_COMPARE(boxes.boxes().size(), 1);
    QCOMPARE(boxes.boxes().first().title, QStringLiteral("Are you sure?"));
    QCOMPARE(boxes.boxes().first().text,
             QStringLiteral("The template is modified, do you want to save it first?"));
    QCOMPARE(boxes.boxes().first().buttons, QMessageBox::Yes | QMessageBox::No);
    QTRY_COMPARE(dialogs.dialogs().size(), answer == QMessageBox::Yes ? 1 : 0);
    QTRY_COMPARE(m_desk->pieces().isEmpty(), clears);
    QCOMPARE(QFile::exists(path), saves);
    QCOMPARE(title().contains(QLatin1Char('*')), !clears);
}

void DeskReportTest::closeAsks_data()
{
    QTest::addColumn<int>("answer");
    QTest::addColumn<bool>("saves");
    QTest::addColumn<bool>("closes");
    QTest::newRow("cancel") << int(QMessageBox::Cancel) << false << false;
    QTest::newRow("no") << int(QMessageBox::No) << false << true;
    QTest::newRow("yes, saved") << int(QMessageBox::Yes) << true << true;
    QTest::newRow("yes, then no file") << int(QMessageBox::Yes) << false << false;
}

void DeskReportTest::closeAsks()
{
    QFETCH(int, answer);
    QFETCH(bool, saves);
    QFETCH(bool, closes);
    openEditor();
    modify();
    const QString path = temporaryPath(QStringLiteral("close.rtp"));
    QFile::remove(path);
    const MessageBoxAnswerer boxes(static_cast<QMessageBox::StandardButton>(answer));
    const FileDialogAnswerer dialogs(saves ? QStringList(path) : QStringList());
    // The panel's button, which then stands over the editor's state.
    m_desk->button("theEditorButton")->click();
    QTRY_COMPARE(boxes.boxes().size(), 1);
    QCOMPARE(boxes.boxes().first().buttons, QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel);
    QTRY_COMPARE(m_desk->editor()->isVisible(), !closes);
    QCOMPARE(m_desk->button("theEditorButton")->isChecked(), !closes);
    QCOMPARE(QFile::exists(path), saves);
}

void DeskReportTest::deactivatingTheToolAsks_data()
{
    QTest::addColumn<int>("answer");
    QTest::addColumn<bool>("closes");
    QTest::newRow("no") << int(QMessageBox::No) << true;
    QTest::newRow("yes, then no file") << int(QMessageBox::Yes) << false;
}

void DeskReportTest::deactivatingTheToolAsks()
{
    QFETCH(int, answer);
    QFETCH(bool, closes);
    openEditor();
    modify();
    m_desk->button("theStatisticsButton")->click();
    QTRY_VERIFY(m_desk->statisticsWindow() && m_desk->statisticsWindow()->isVisible());
    const MessageBoxAnswerer boxes(static_cast<QMessageBox::StandardButton>(answer));
    const FileDialogAnswerer dialogs;
    m_desk->tool()->getToolButton()->click();
    QTRY_COMPARE(boxes.boxes().size(), 1);
    QCOMPARE(boxes.boxes().first().buttons, QMessageBox::Yes | QMessageBox::No);
    QTRY_COMPARE(m_desk->editor()->isVisible(), !closes);
    QTRY_VERIFY(!m_desk->statisticsWindow()->isVisible());
    QVERIFY(!m_desk->button("theStatisticsButton")->isChecked());
}

void DeskReportTest::tellsWhatFailed()
{
    openEditor();
    const QString broken = temporaryPath(QStringLiteral("broken.rtp"));
    const QString missing = temporaryPath(QStringLiteral("missing.rtp"));
    writeFile(broken, "{ no json");
    const QString folder = temporaryPath(QStringLiteral("nowhere"));
    const FileDialogAnswerer dialogs(
        {broken, folder + QStringLiteral("/x.rtp"), folder + QStringLiteral("/x.pdf")});
    const MessageBoxAnswerer boxes;
    m_user.press(Qt::Key_O, Qt::ControlModifier);
    QTRY_COMPARE(boxes.boxes().size(), 1);
    QCOMPARE(boxes.boxes().at(0).title, QStringLiteral("Error reading file"));
    QCOMPARE(boxes.boxes().at(0).text, QStringLiteral("Cannot read file %1").arg(broken));
    m_user.press(Qt::Key_S, Qt::ControlModifier);
    QTRY_COMPARE(boxes.boxes().size(), 2);
    QCOMPARE(boxes.boxes().at(1).title, QStringLiteral("Cannot save"));
    expectWarning(QRegularExpression(QStringLiteral("QPainter::begin")));
    m_user.press(Qt::Key_P, Qt::ControlModifier);
    QTRY_COMPARE(boxes.boxes().size(), 3);
    QCOMPARE(boxes.boxes().at(2).title, QStringLiteral("Save failed"));
    QCOMPARE(boxes.boxes().at(2).text, QStringLiteral("Cannot write to file %1/x.pdf").arg(folder));
    QCOMPARE(boxes.boxes().at(2).icon, QMessageBox::Critical);
}

void DeskReportTest::exportsFromThePanel_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QStringList>("texts"); // one of each block at least
    const QStringList ofEveryBlock{QStringLiteral("Statistical report"), QStringLiteral("Holes"),
                                   QStringLiteral("Circle/Area(mm²)"),   QStringLiteral("Rectangle/Width("),
                                   QStringLiteral("Measurement Type"),   QStringLiteral("Circle 15")};
    QTest::newRow("demo") << QStringLiteral("demo.rtp") << QStringList{QStringLiteral("Circle 15")};
    QTest::newRow("every block") << QStringLiteral("every-block.rtp") << ofEveryBlock;
    QTest::newRow("every block, dark") << QStringLiteral("every-block-dark.rtp") << ofEveryBlock;
}

void DeskReportTest::exportsFromThePanel()
{
    QFETCH(QString, name);
    QFETCH(QStringList, texts);
    ZtStatusLog::getInstance()->clear();
    m_user.click(m_desk->button("theExportButton"));
    QTRY_VERIFY(!ZtStatusLog::getInstance()->entries().isEmpty());
    QCOMPARE(ZtStatusLog::getInstance()->entries().last().message,
             QStringLiteral("No report template selected."));

    const QString pdf = temporaryPath(QFileInfo(name).completeBaseName() + QStringLiteral(".pdf"));
    const QString chosen = sourcePath(QStringLiteral("examples/templates/") + name);
    const FileDialogAnswerer dialogs({chosen, pdf});
    m_user.click(m_desk->button("theBrowseButton"));
    QTRY_COMPARE(m_desk->templates()->currentText(), name);
    m_user.click(m_desk->button("theExportButton"));
    QTRY_COMPARE(dialogs.dialogs().size(), 2);
    QTRY_VERIFY(PdfFile(pdf).isSound());
    const QString printed = PdfFile(pdf).pageTexts().join(QLatin1Char('\n'));
    for (const QString &text : qAsConst(texts))
        QVERIFY2(printed.contains(text), qPrintable(text));
    QVERIFY(!m_desk->editor()->isVisible());
}

void DeskReportTest::keepsTheRecentTemplates()
{
    const QString settings = temporaryPath(QStringLiteral("recent.ini"));
    ZtAppSettings::getInstance()->setStoragePath(settings);
    QStringList paths;
    for (int i = 0; i < 6; ++i) {
        paths.append(temporaryPath(QStringLiteral("recent%1.rtp").arg(i)));
        writeFile(paths.last(), "{}");
    }
    {
        const FileDialogAnswerer dialogs(paths);
        for (int i = 0; i < 6; ++i) {
            m_user.click(m_desk->button("theBrowseButton"));
            QTRY_COMPARE(m_desk->templates()->currentData().toString(), paths.at(i));
        }
    }
    QCOMPARE(m_desk->templates()->count(), 5);
    m_desk->window()->close();
    ZtAppSettings::getInstance()->sync();
    m_desk.reset();
    QVERIFY(QFile::remove(paths.at(4)));

    m_desk = std::make_unique<RunningDesk>();
    QStringList kept;
    for (int i = 0; i < m_desk->templates()->count(); ++i)
        kept.append(m_desk->templates()->itemData(i).toString());
    QCOMPARE(kept, QStringList({paths.at(5), paths.at(3), paths.at(2), paths.at(1)}));
    QCOMPARE(m_desk->templates()->currentIndex(), 0);
    QCOMPARE(m_desk->templates()->toolTip(), paths.at(5));
}

void DeskReportTest::themeAndLanguageChangeWhileAllIsOpen()
{
    openEditor();
    compose();
    addText(QStringLiteral("still here"));
    m_desk->button("theStatisticsButton")->click();
    QTRY_VERIFY(m_desk->statisticsWindow());
    const int pieces = m_desk->pieces().size();
    KvDeskTheme::apply(QStringLiteral("Light"));
    QCoreApplication::processEvents();
    QTranslator translator;
    QVERIFY(translator.load(QStringLiteral(":/statreportingplugin/German.qm")));
    QCoreApplication::installTranslator(&translator);
    QCoreApplication::processEvents();
    KvDeskTheme::apply(QStringLiteral("Dark"));
    QCoreApplication::removeTranslator(&translator);
    QCoreApplication::processEvents();
    QCOMPARE(m_desk->pieces().size(), pieces);
    QCOMPARE(RunningDesk::textIn(m_desk->pieces().first())->toPlainText(), QStringLiteral("still here"));
    QVERIFY(m_desk->options());
}

void DeskReportTest::pluginDiesWithItsWindowsOpen()
{
    openEditor();
    compose();
    addText(QStringLiteral("open"));
    m_desk->button("theStatisticsButton")->click();
    QTRY_VERIFY(m_desk->statisticsWindow());
    m_desk->deletePlugins();
    QVERIFY(!m_desk->editor());
    QVERIFY(!m_desk->statisticsWindow());
    QCoreApplication::processEvents();
    QVERIFY(m_desk->window()->isVisible());
}

void DeskReportTest::programEndsWithItsWindowsOpen()
{
    openEditor();
    m_desk->button("theStatisticsButton")->click();
    QTRY_VERIFY(m_desk->statisticsWindow());
    QSignalSpy ends(ZtSignalCenter::getInstance(), SIGNAL(signalAppAboutToClose()));
    m_desk->window()->close();
    QTRY_COMPARE(ends.count(), 1);
    m_desk.reset();
    QCOMPARE(ends.count(), 1);
}

STATREPORT_TEST_MAIN(DeskReportTest)

#include "DeskReportTest.moc"
