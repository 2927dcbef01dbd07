// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "DeskUser.h"
#include "KvDeskActions.h"
#include "KvDeskElidedLabel.h"
#include "KvDeskExposureControl.h"
#include "KvDeskLiveBar.h"
#include "KvDeskSourceMenu.h"
#include "KvDeskStatusLog.h"
#include "RunningDesk.h"
#include "host/desk/DeskLog.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtAravisSource.h"
#include "measuring/ZtKernelImage.h"
#include "report/PdfFile.h"
#include "support/FileDialogAnswerer.h"

#include <QAction>
#include <QDoubleSpinBox>
#include <QMenuBar>

#include <cmath>

namespace {

constexpr int kCameraTimeout = 20000; ///< ms; a camera of the network may take its time
constexpr int kSide = 64;             ///< pixels to which pictures are reduced before they are compared
constexpr double kSame = 8.0;         ///< of 255; scaling alone makes less

QImage reduced(const QImage &image)
{
    return image.scaled(kSide, kSide, Qt::IgnoreAspectRatio, Qt::SmoothTransformation)
        .convertToFormat(QImage::Format_Grayscale8);
}

// Mean of the differences of the grey values.
double difference(const QImage &one, const QImage &other)
{
    const QImage a = reduced(one);
    const QImage b = reduced(other);
    double sum = 0.0;
    for (int y = 0; y < kSide; ++y) {
        for (int x = 0; x < kSide; ++x)
            sum += std::abs(a.constScanLine(y)[x] - b.constScanLine(y)[x]);
    }
    return sum / (kSide * kSide);
}

double brightness(const QImage &image)
{
    QImage black(image.size(), QImage::Format_RGB32);
    black.fill(Qt::black);
    return difference(image, black);
}

} // namespace

/**
 * A camera from the Desk's menu to the printed report, as a person uses it: off-screen and, with real mouse
 * and keys, under an X server. The camera is simulated by the library that talks to it, not by us.
 */
class DeskLiveReportTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();
    void init();
    void cleanup();

    void blockFollowsTheCamera();
    void freezing();
    void exposure();
    void stoppingAndStarting();
    void unplugging();
    void printing_data();
    void printing();

private:
    void openCamera();
    void openEditor();
    void addBlock();
    void activateDesk() { m_user.activate(m_desk->window()); }
    QAction *cameraAction() const;
    ZtAravisSource *camera() const
    {
        return dynamic_cast<ZtAravisSource *>(m_desk->document()->frameSource());
    }
    KvDeskLiveBar *bar() const { return m_desk->window()->liveBar(); }
    QImage frame() const { return m_desk->document()->kernelImage()->frame(); }
    QImage shown() const;
    bool isFrameShown() const { return difference(shown(), frame()) < kSame; }
    bool changesWithin(int milliseconds) const;

    std::unique_ptr<RunningDesk> m_desk;
    DeskUser m_user;
};

void DeskLiveReportTest::initTestCase()
{
    ZtAravisSource::enableFakeCamera();
}

void DeskLiveReportTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    ZtStatusLog::getInstance()->clear();
    m_desk = std::make_unique<RunningDesk>();
    m_desk->window()->actions()->action(KvDeskActions::ShowValues)->setChecked(false);
    m_desk->window()->move(0, 0);
    m_desk->window()->resize(860, 700);
    QVERIFY(QTest::qWaitForWindowExposed(m_desk->window()));
    activateDesk();
    openCamera();
    if (!QTest::currentTestFailed())
        openEditor();
    if (!QTest::currentTestFailed())
        addBlock();
}

void DeskLiveReportTest::cleanup()
{
    m_desk.reset();
    StatReportTest::cleanup();
}

QAction *DeskLiveReportTest::cameraAction() const
{
    for (QAction *const action : m_desk->window()->sourceMenu()->actions()) {
        if (action->text().startsWith(QLatin1String("Aravis Fake")))
            return action;
    }
    return nullptr;
}

void DeskLiveReportTest::openCamera()
{
    KvDeskSourceMenu *const sources = m_desk->window()->sourceMenu();
    QMenuBar *const menus = m_desk->window()->menuBar();
    QMenu *const imageMenu = menus->actions().at(2)->menu();
    QVERIFY(imageMenu->actions().contains(sources->menuAction()));
    // Popups are new to the off-screen platform.
    for (int i = 0; !DeskUser::isReal() && i < 2; ++i) {
        expectWarning(QRegularExpression(QStringLiteral("does not support raise")));
        expectWarning(QRegularExpression(QStringLiteral("does not support grabbing the keyboard")));
    }
    m_user.click(menus, menus->actionGeometry(imageMenu->menuAction()).center());
    QTRY_VERIFY(imageMenu->isVisible());
    m_user.click(imageMenu, imageMenu->actionGeometry(sources->menuAction()).center());
    QTRY_VERIFY(sources->isVisible());
    // It is found while the menu is open.
    QTRY_VERIFY_WITH_TIMEOUT(cameraAction(), kCameraTimeout);
    QTest::qWait(50);
    m_user.click(sources, sources->actionGeometry(cameraAction()).center());
    QTRY_VERIFY_WITH_TIMEOUT(!frame().isNull(), kCameraTimeout);
    QVERIFY(camera());
    QTRY_VERIFY(bar()->isVisible());
    QTRY_VERIFY2(bar()->status()->text().startsWith(QLatin1String("Live: Aravis Fake")),
                 qPrintable(bar()->status()->text()));
}

void DeskLiveReportTest::openEditor()
{
    m_user.click(m_desk->button("theEditorButton"));
    QVERIFY(m_desk->placeEditor());
    m_user.activate(m_desk->editor());
    QTest::qWait(100);
}

void DeskLiveReportTest::addBlock()
{
    QWidget *const tool = m_desk->palette().at(1);
    m_user.drag(tool, tool->rect().center(), m_desk->pages()->viewport(), QPoint(150, 100));
    QTRY_COMPARE(m_desk->pieceClasses(), QStringList(QStringLiteral("KvCameraImageWidget")));
    QTRY_VERIFY(m_desk->options());
}

// The picture in the block, which is as high as the picture.
QImage DeskLiveReportTest::shown() const
{
    QLayout *const content =
        m_desk->pieces().at(0)->widget()->findChild<QLayout *>(QStringLiteral("contentVerticalLayout"));
    const QImage block = content->itemAt(0)->widget()->grab().toImage();
    const int side = block.height();
    return block.copy((block.width() - side) / 2, 0, side, side);
}

bool DeskLiveReportTest::changesWithin(int milliseconds) const
{
    const QImage before = shown();
    return QTest::qWaitFor([&]() { return difference(shown(), before) > kSame; }, milliseconds);
}

void DeskLiveReportTest::blockFollowsTheCamera()
{
    QVERIFY(brightness(shown()) > 30.0);
    for (int i = 0; i < 3; ++i)
        QVERIFY(changesWithin(5000));
    // Some frames old it may be, but not of another kind.
    QTRY_VERIFY(isFrameShown());
    QVERIFY(camera()->frameRate() > 5.0);
}

void DeskLiveReportTest::freezing()
{
    activateDesk();
    m_user.press(Qt::Key_F12);
    QTRY_VERIFY(m_desk->document()->kernelImage()->isFrozen());
    QTRY_VERIFY(isFrameShown());
    QVERIFY(!changesWithin(1000));
    QVERIFY(isFrameShown());
    m_user.click(bar()->freezeButton());
    QTRY_VERIFY(!m_desk->document()->kernelImage()->isFrozen());
    QVERIFY(changesWithin(5000));
}

void DeskLiveReportTest::exposure()
{
    activateDesk();
    QDoubleSpinBox *const field = bar()->exposure()->field();
    QTRY_VERIFY(field->isVisible());
    m_user.click(field->findChild<QLineEdit *>());
    QTRY_VERIFY(field->hasFocus());
    // This camera is black up to a tenth of the exposure it begins with.
    m_user.press(Qt::Key_A, Qt::ControlModifier);
    m_user.type(QStringLiteral("1"));
    m_user.press(Qt::Key_Return);
    QTRY_COMPARE(camera()->exposure(), 1.0);
    QTRY_VERIFY(brightness(shown()) < 1.0);
    m_user.press(Qt::Key_A, Qt::ControlModifier);
    m_user.type(QStringLiteral("100"));
    m_user.press(Qt::Key_Return);
    QTRY_COMPARE(camera()->exposure(), 100.0);
    QTRY_VERIFY(brightness(shown()) > 150.0);
}

void DeskLiveReportTest::stoppingAndStarting()
{
    activateDesk();
    m_user.click(bar()->runButton());
    QTRY_COMPARE(camera()->state(), ZtFrameSource::Stopped);
    QTRY_VERIFY(isFrameShown());
    QVERIFY(!changesWithin(1000));
    QVERIFY(bar()->status()->text().endsWith(QLatin1String("is stopped")));
    m_user.click(bar()->runButton());
    QTRY_COMPARE(camera()->state(), ZtFrameSource::Running);
    QVERIFY(changesWithin(kCameraTimeout));
}

void DeskLiveReportTest::unplugging()
{
    const QString title = camera()->displayName();
    camera()->simulateUnplugging();
    QTRY_COMPARE(camera()->state(), ZtFrameSource::Lost);
    QTRY_COMPARE(DeskLog::messages(ZtAppStatus::Warning),
                 QStringList(title + QStringLiteral(" is disconnected; its last picture stays")));
    QTRY_VERIFY(isFrameShown());
    QVERIFY(!changesWithin(1000));
    QVERIFY(brightness(shown()) > 30.0);

    activateDesk();
    QCOMPARE(bar()->runButton()->text(), QStringLiteral("&Reconnect"));
    m_user.click(bar()->runButton());
    QTRY_COMPARE(camera()->state(), ZtFrameSource::Running);
    QVERIFY(changesWithin(kCameraTimeout));
    QTRY_VERIFY(DeskLog::messages(ZtAppStatus::Information)
                    .contains(title + QStringLiteral(" delivers pictures again")));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Warning).size(), 1);
}

void DeskLiveReportTest::printing_data()
{
    QTest::addColumn<bool>("isLost");
    QTest::newRow("frozen") << false;
    QTest::newRow("lost") << true;
}

void DeskLiveReportTest::printing()
{
    QFETCH(bool, isLost);
    if (isLost) {
        camera()->simulateUnplugging();
        QTRY_COMPARE(camera()->state(), ZtFrameSource::Lost);
    } else {
        activateDesk();
        m_user.press(Qt::Key_F12);
        QTRY_VERIFY(m_desk->document()->kernelImage()->isFrozen());
    }
    QTRY_VERIFY(isFrameShown());
    m_user.activate(m_desk->editor());
    const QString pdf = temporaryPath(QStringLiteral("live %1.pdf").arg(isLost));
    const FileDialogAnswerer dialogs(pdf);
    m_user.press(Qt::Key_P, Qt::ControlModifier);
    QTRY_COMPARE(dialogs.dialogs().size(), 1);
    QTRY_VERIFY(PdfFile(pdf).isSound());
    QCOMPARE(PdfFile(pdf).pictures().size(), 1);
    QCOMPARE(PdfFile(pdf).firstPicture().convertToFormat(QImage::Format_RGB32),
             frame().convertToFormat(QImage::Format_RGB32));
    // Nothing of it ended the block.
    QVERIFY(isFrameShown());
}

STATREPORT_TEST_MAIN(DeskLiveReportTest)
#include "DeskLiveReportTest.moc"
