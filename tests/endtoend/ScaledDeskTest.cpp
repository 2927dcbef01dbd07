// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "DeskUser.h"
#include "KvDeskActions.h"
#include "KvDeskCalibrationDialog.h"
#include "KvDeskExportDialog.h"
#include "KvDeskImageView.h"
#include "KvDeskObjectState.h"
#include "KvDeskSettingsDialog.h"
#include "RunningDesk.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtObjectsPainter.h"
#include "report/PdfFile.h"
#include "support/FileDialogAnswerer.h"

#include <QAbstractButton>
#include <QAction>

namespace {

using A = KvDeskActions;

constexpr QSize imageSize(200, 150);
const char reportVariable[] = "STATREPORT_SCALED_REPORT";

/// Pixels of the screen per pixel of the windows, as the environment of this program says.
double factor()
{
    const QByteArray given = qgetenv("QT_SCALE_FACTOR");
    return given.isEmpty() ? 1.0 : given.toDouble();
}

/// No two pixels have the same colour.
QImage manyColors()
{
    QImage image(imageSize, QImage::Format_RGB32);
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            image.setPixel(x, y, qRgb(x, y, 128));
    }
    return image;
}

/// What reports say when they were made differs from one to the next.
bool isTime(const QString &word)
{
    return word.contains(QRegularExpression(QStringLiteral("\\d:\\d\\d")));
}

QStringList wordsOf(const PdfFile &pdf)
{
    QStringList words;
    for (int page = 0; page < pdf.pageCount(); ++page) {
        for (const PdfWord &word : pdf.wordsOf(page)) {
            if (!isTime(word.text))
                words.append(QStringLiteral("%1: %2 %3 %4 %5")
                                 .arg(page)
                                 .arg(word.text)
                                 .arg(word.rect.x(), 0, 'f', 2)
                                 .arg(word.rect.y(), 0, 'f', 2)
                                 .arg(word.rect.width(), 0, 'f', 2));
        }
    }
    return words;
}

QVector<QSize> pictureSizes(const PdfFile &pdf)
{
    QVector<QSize> sizes;
    for (const PdfPicture &picture : pdf.pictures())
        sizes.append(picture.size);
    return sizes;
}

} // namespace

/**
 * The Desk and the plug-in on screens with more pixels: runs once for each scale factor, which the
 * environment gives to the whole program.
 */
class ScaledDeskTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void theFactorIsInForce();
    void windowsFitTheScreen();
    void imagesAreSharp();
    void strokesHitThePixels();
    void objectsLieWhereTheyWereDrawn();
    void rulersMeasureTheImage();
    void iconsAreSharp();
    void thumbnailsAreSharp();
    void blocksAreDragged();
    void writesReport();
    void reportsAreThoseOfOtherScreens();

private:
    void openImage();
    void openSession();
    void openEditor();
    QImage shownImage() const { return view()->viewport()->grab().toImage(); }
    QColor shownAt(const QImage &shown, const QPointF &imagePoint) const;
    QPoint at(double x, double y) const { return view()->mapFromScene(QPointF(x, y)); }
    void checkIcons(QWidget *window);

    KvDeskMainWindow *window() const { return m_desk->window(); }
    KvDeskImageView *view() const { return window()->imageView(); }

    std::unique_ptr<RunningDesk> m_desk;
    DeskUser m_user;
};

void ScaledDeskTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    m_desk = std::make_unique<RunningDesk>();
    window()->move(0, 0);
    window()->resize(1280, 800);
    QVERIFY(QTest::qWaitForWindowExposed(window()));
    m_user.activate(window());
}

void ScaledDeskTest::cleanup()
{
    m_desk.reset();
    StatReportTest::cleanup();
}

void ScaledDeskTest::openImage()
{
    const QString path = temporaryPath(QStringLiteral("colors.png"));
    QVERIFY(manyColors().save(path));
    QVERIFY(window()->files()->openImage(path));
    window()->actions()->action(A::ShowLabels)->setChecked(false);
    window()->actions()->action(A::ZoomActual)->trigger();
    QTRY_COMPARE(view()->zoom(), 1.0);
    QTRY_VERIFY(!view()->frame().image().isNull());
}

void ScaledDeskTest::openSession()
{
    QVERIFY(window()->files()->openSession(sourcePath(QStringLiteral("examples/sessions/demo.json"))));
}

void ScaledDeskTest::openEditor()
{
    m_desk->button("theEditorButton")->click();
    QTRY_VERIFY(m_desk->editor() && m_desk->editor()->isVisible());
    m_desk->editor()->resize(1280, 800);
    QVERIFY(QTest::qWaitForWindowExposed(m_desk->editor()));
}

QColor ScaledDeskTest::shownAt(const QImage &shown, const QPointF &imagePoint) const
{
    const QPointF place = view()->viewportTransform().map(imagePoint) * factor();
    return shown.pixelColor(int(std::floor(place.x())), int(std::floor(place.y())));
}

void ScaledDeskTest::theFactorIsInForce()
{
    QCOMPARE(window()->devicePixelRatioF(), factor());
    QCOMPARE(window()->grab().devicePixelRatio(), factor());
}

/// The smallest screens that people use at a scale, less what the desktop takes.
void ScaledDeskTest::windowsFitTheScreen()
{
    const QSize screen = QSizeF(QSize(3840, 2160) / 3.0).toSize() - QSize(0, 48);
    openSession();
    openEditor();
    m_desk->button("theStatisticsButton")->click();
    QTRY_VERIFY(m_desk->statisticsWindow() && m_desk->statisticsWindow()->isVisible());
    window()->actions()->action(A::Calibrate)->trigger();
    KvDeskSettingsDialog settings(window());
    settings.show();
    KvDeskExportDialog exporting({}, window());
    exporting.show();
    int count = 0;
    for (QWidget *const widget : QApplication::topLevelWidgets()) {
        if (!widget->isVisible() || widget->graphicsProxyWidget())
            continue;
        const QSize least = widget->minimumSize();
        // The editor has one width, that of its pages: it reaches beyond such a screen by 36 pixels.
        const bool isAsWideAsPages = widget->inherits("KvReportTemplatesEditor");
        QVERIFY2((isAsWideAsPages || least.width() <= screen.width()) && least.height() <= screen.height(),
                 qPrintable(QStringLiteral("%1 %2x%3")
                                .arg(QLatin1String(widget->metaObject()->className()))
                                .arg(least.width())
                                .arg(least.height())));
        ++count;
    }
    QVERIFY(count >= 6);
}

/// Each pixel of the image on one of the screen, none blurred or left out.
void ScaledDeskTest::imagesAreSharp()
{
    openImage();
    const QImage shown = shownImage();
    const QImage image = manyColors();
    QCOMPARE(shown.devicePixelRatio(), factor());
    for (int y = 1; y < image.height(); y += 7) {
        for (int x = 1; x < image.width(); x += 3)
            QCOMPARE(shownAt(shown, QPointF(x + 0.5, y + 0.5)).rgb(), image.pixel(x, y));
    }
}

void ScaledDeskTest::strokesHitThePixels()
{
    openImage();
    window()->actions()->action(A::LineTool)->trigger();
    const QPoint start = at(40, 30);
    const QPoint end = at(160, 110);
    m_user.stroke(view()->viewport(), start, end);
    QTRY_VERIFY(KvDeskObjectState::of({ZtDrawnType::Line, 1}).exists);
    const QPolygonF points = KvDeskObjectState::of({ZtDrawnType::Line, 1}).points;
    QCOMPARE(points.size(), 2);
    // The pointer stands on pixels of the window, which are larger than those of the image.
    QVERIFY(QLineF(points.first(), QPointF(40, 30)).length() <= factor());
    QVERIFY(QLineF(points.last(), QPointF(160, 110)).length() <= factor());
    QCOMPARE(at(points.first().x(), points.first().y()), start);
}

void ScaledDeskTest::objectsLieWhereTheyWereDrawn()
{
    openImage();
    window()->actions()->action(A::LineTool)->trigger();
    const QImage before = shownImage();
    m_user.stroke(view()->viewport(), at(40, 60), at(160, 60));
    QTRY_VERIFY(KvDeskObjectState::of({ZtDrawnType::Line, 1}).exists);
    window()->actions()->action(A::SelectTool)->trigger();
    const QPolygonF line = KvDeskObjectState::of({ZtDrawnType::Line, 1}).points;
    const QPointF middle = (line.first() + line.last()) / 2;
    QTRY_VERIFY(shownAt(shownImage(), middle) != shownAt(before, middle));
    const QImage after = shownImage();
    // Everything else is as before.
    for (const double corner : {2.5, 197.5})
        QCOMPARE(shownAt(after, QPointF(corner, 145.5)), shownAt(before, QPointF(corner, 145.5)));

    // A picture for a report has the image's own pixels, whatever the screen's.
    QImage burnt = manyColors();
    QPainter painter(&burnt);
    ZtObjectsPainter().drawObjects(&painter, {ZtDrawnType::Line});
    painter.end();
    QVERIFY(burnt.pixel(middle.toPoint()) != manyColors().pixel(middle.toPoint()));
    const QRect clear(0, 120, imageSize.width(), 30);
    QCOMPARE(burnt.copy(clear), manyColors().copy(clear));
}

void ScaledDeskTest::rulersMeasureTheImage()
{
    openImage();
    const double perPixel = view()->pixel();
    QCOMPARE(perPixel, factor());
    QCOMPARE(view()->mapToScene(at(100, 75) + QPoint(10, 0)).x() - view()->mapToScene(at(100, 75)).x(),
             10 * perPixel);
}

void ScaledDeskTest::checkIcons(QWidget *window)
{
    int icons = 0;
    for (QWidget *const widget : window->findChildren<QWidget *>()) {
        const auto *const button = qobject_cast<QAbstractButton *>(widget);
        const auto *const label = qobject_cast<QLabel *>(widget);
        if (!widget->isVisible() || widget->window() != window)
            continue;
        if (button && !button->icon().isNull()) {
            const QPixmap pixmap = button->icon().pixmap(window->windowHandle(), button->iconSize());
            QVERIFY2(pixmap.width() >=
                         qMin(button->iconSize().width(), button->iconSize().height()) * factor(),
                     qPrintable(button->toolTip()));
            ++icons;
        } else if (label && !label->pixmap(Qt::ReturnByValue).isNull()) {
            QVERIFY2(label->pixmap(Qt::ReturnByValue).devicePixelRatio() == factor(),
                     qPrintable(label->objectName()));
            ++icons;
        }
    }
    QVERIFY(icons > 0);
}

void ScaledDeskTest::iconsAreSharp()
{
    openSession();
    checkIcons(window());
    openEditor();
    checkIcons(m_desk->editor());
}

/// Of the examples on the start page.
void ScaledDeskTest::thumbnailsAreSharp()
{
    checkIcons(window());
}

void ScaledDeskTest::blocksAreDragged()
{
    openSession();
    openEditor();
    m_user.activate(m_desk->editor());
    QWidget *const row = m_desk->palette().first();
    QGraphicsView *const pages = m_desk->pages();
    m_user.drag(row, row->rect().center(), pages->viewport(), pages->viewport()->rect().center());
    QTRY_COMPARE(m_desk->pieces().size(), 1);
    const QGraphicsProxyWidget *const piece = m_desk->pieces().first();
    // As wide on the page as on any other screen.
    QVERIFY(piece->size().width() <= pages->scene()->width());
    m_user.clickScene(pages, m_desk->centerOf(piece));
    QTRY_VERIFY(m_desk->options() && m_desk->options()->isVisible());
}

void ScaledDeskTest::writesReport()
{
    openSession();
    const QString pdf = qEnvironmentVariable(reportVariable, temporaryPath(QStringLiteral("scaled.pdf")));
    const FileDialogAnswerer dialogs({sourcePath(QStringLiteral("examples/templates/every-block.rtp")), pdf});
    m_desk->button("theBrowseButton")->click();
    QTRY_COMPARE(m_desk->templates()->currentText(), QStringLiteral("every-block.rtp"));
    m_desk->button("theExportButton")->click();
    QTRY_VERIFY(PdfFile(pdf).isSound());
}

/// Another run of this program makes the report at scale 1.
void ScaledDeskTest::reportsAreThoseOfOtherScreens()
{
    // A file that is there would be asked about.
    QFile::remove(temporaryPath(QStringLiteral("scaled.pdf")));
    writesReport();
    const PdfFile here(temporaryPath(QStringLiteral("scaled.pdf")));
    const QString path = temporaryPath(QStringLiteral("plain.pdf"));
    QProcess process;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("QT_SCALE_FACTOR"), QStringLiteral("1"));
    environment.insert(QLatin1String(reportVariable), path);
    process.setProcessEnvironment(environment);
    process.start(QCoreApplication::applicationFilePath(), {QStringLiteral("writesReport")});
    QVERIFY(process.waitForFinished(60000));
    QCOMPARE(process.exitCode(), 0);
    const PdfFile plain(path);
    QVERIFY(plain.pageCount() > 1);
    QCOMPARE(here.mediaBoxes(), plain.mediaBoxes());
    QCOMPARE(wordsOf(here), wordsOf(plain));
    QCOMPARE(pictureSizes(here), pictureSizes(plain));
    for (int page = 0; page < plain.pageCount(); ++page)
        QCOMPARE(here.rendered(page, 50).size(), plain.rendered(page, 50).size());
}

// As in the Desk's own main().
int main(int argc, char **argv)
{
    QCoreApplication::setAttribute(Qt::AA_EnableHighDpiScaling);
    QCoreApplication::setAttribute(Qt::AA_UseHighDpiPixmaps);
    return runStatReportTest(argc, argv, []() -> StatReportTest * { return new ScaledDeskTest; });
}
#include "ScaledDeskTest.moc"
