// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "DeskUser.h"
#include "KvDeskActions.h"
#include "KvDeskEmptyState.h"
#include "KvDeskFirstTemplates.h"
#include "KvDeskImageView.h"
#include "KvDeskSession.h"
#include "KvDeskStartPage.h"
#include "KvDeskTableView.h"
#include "KvDeskToolBox.h"
#include "KvDeskValueTable.h"
#include "KvDeskValueTableModel.h"
#include "RunningDesk.h"
#include "kernel/ZtAppSettings.h"
#include "report/PdfFile.h"
#include "support/FileDialogAnswerer.h"

#include <QAction>

/**
 * The first minutes of somebody who has read nothing: from the start page to a PDF with a length that was
 * measured on the example of a coin.
 */
class FirstReportTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void fromTheStartPageToAReport();

private:
    QPoint inView(double x, double y) const;

    std::unique_ptr<RunningDesk> m_desk;
    DeskUser m_user;
};

void FirstReportTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    KvDeskFirstTemplates::offer(sourcePath(QStringLiteral("examples/templates")));
    m_desk = std::make_unique<RunningDesk>();
    m_desk->window()->move(0, 0);
    m_desk->window()->resize(1280, 800);
    QVERIFY(QTest::qWaitForWindowExposed(m_desk->window()));
    m_user.activate(m_desk->window());
}

void FirstReportTest::cleanup()
{
    m_desk.reset();
    StatReportTest::cleanup();
}

QPoint FirstReportTest::inView(double x, double y) const
{
    return m_desk->window()->imageView()->mapFromScene(QPointF(x, y));
}

void FirstReportTest::fromTheStartPageToAReport()
{
    KvDeskMainWindow *const window = m_desk->window();
    KvDeskImageView *const view = window->imageView();
    QVERIFY(window->startPage()->isVisible());
    QToolButton *const coin = window->startPage()->exampleButtons().value(0);
    QVERIFY(coin);
    QCOMPARE(coin->text(), QStringLiteral("Coin: first length"));
    QTRY_VERIFY(coin->width() > 100 && coin->y() > 0);
    m_user.click(coin);
    QTRY_VERIFY(!view->frame().isNull());
    QTRY_VERIFY(!view->emptyState()->isVisible());
    QCOMPARE(window->session()->displayName(), QStringLiteral("Untitled session"));

    // The coin is 2.25 cm across, with its middle at (360, 228).
    m_user.press(Qt::Key_L);
    QTRY_VERIFY(window->actions()->action(KvDeskActions::LineTool)->isChecked());
    m_user.stroke(view->viewport(), inView(180, 228), inView(540, 228));
    QTRY_COMPARE(window->session()->objectCount(), 1);
    const QAbstractItemModel *const values = window->valueTable()->findChild<KvDeskTableView *>()->model();
    QTRY_COMPARE(values->rowCount(), 1);
    const QString length = values->index(0, values->columnCount() - 1).data().toString();
    QVERIFY2(length.startsWith(QLatin1String("2.2")) && length.endsWith(QLatin1String(" cm")),
             qPrintable(length));

    // The simplest template is chosen already.
    QCOMPARE(m_desk->templates()->currentText(), QStringLiteral("summary.rtp"));
    const QString pdf = temporaryPath(QStringLiteral("coin.pdf"));
    const FileDialogAnswerer dialogs(pdf);
    m_user.click(m_desk->button("theExportButton"));
    QTRY_COMPARE(dialogs.dialogs().size(), 1);
    QTRY_VERIFY(PdfFile(pdf).isSound());
    const QStringList pages = PdfFile(pdf).pageTexts();
    QCOMPARE(pages.size(), 1);
    for (const char *const text : {"Measurement summary", "Statistics", "Line", "Length", "2.2"})
        QVERIFY2(pages.first().contains(QLatin1String(text)), text);
}

STATREPORT_TEST_MAIN(FirstReportTest)
#include "FirstReportTest.moc"
