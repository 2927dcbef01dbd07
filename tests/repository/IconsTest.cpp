// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "repository/SourceTree.h"

#include <QImage>
#include <QPainter>
#include <QSvgRenderer>
#include <QXmlStreamReader>

#include <algorithm>
#include <cmath>

namespace {

/// Icons of one resource list: everything that the sources in \c users name is in \c folder.
struct IconSet
{
    QString folder;
    QString resourceList;
    QString users;
};

const IconSet reportIcons{QStringLiteral("src/resources"), QStringLiteral("src/resources/statreport.qrc"),
                          QStringLiteral("src/")};
const IconSet deskIcons{QStringLiteral("host/desk"), QStringLiteral("host/desk/desk.qrc"),
                        QStringLiteral("host/desk/")};

const QStringList reportNames{
    QStringLiteral("EmptyImage"),
    QStringLiteral("IconAlignCenter"),
    QStringLiteral("IconAlignLeft"),
    QStringLiteral("IconAlignRight"),
    QStringLiteral("IconFooter"),
    QStringLiteral("IconGallery"),
    QStringLiteral("IconHeader"),
    QStringLiteral("IconLink"),
    QStringLiteral("IconPageNumber"),
    QStringLiteral("IconRightAngle"),
    QStringLiteral("IconTextAlignCenter"),
    QStringLiteral("IconTextAlignLeft"),
    QStringLiteral("IconTextAlignRight"),
    QStringLiteral("IconTextAlignScatter"),
    QStringLiteral("IconTextSubscript"),
    QStringLiteral("IconTextSuperscript"),
    QStringLiteral("IconTrash"),
    QStringLiteral("ToolIconCameraImageView"),
    QStringLiteral("ToolIconDots"),
    QStringLiteral("ToolIconImageView"),
    QStringLiteral("ToolIconMinMax"),
    QStringLiteral("ToolIconPie"),
    QStringLiteral("ToolIconStats"),
    QStringLiteral("ToolIconTable"),
    QStringLiteral("ToolIconText"),
    QStringLiteral("ToolIconTrend"),
    QStringLiteral("arrow-down"),
    QStringLiteral("arrow-up"),
    QStringLiteral("browse"),
    QStringLiteral("clear"),
    QStringLiteral("editor"),
    QStringLiteral("export-pdf"),
    QStringLiteral("open"),
    QStringLiteral("print"),
    QStringLiteral("save"),
    QStringLiteral("save-as"),
    QStringLiteral("statreport"),
    QStringLiteral("statwin"),
    QStringLiteral("titlebar-close"),
};

const QStringList deskNames{
    QStringLiteral("about"),        QStringLiteral("close-panel"),    QStringLiteral("import-table"),
    QStringLiteral("log"),          QStringLiteral("measuringdesk"),  QStringLiteral("open-image"),
    QStringLiteral("open-session"), QStringLiteral("recent"),         QStringLiteral("save-session"),
    QStringLiteral("settings"),     QStringLiteral("status-clear"),   QStringLiteral("status-error"),
    QStringLiteral("status-info"),  QStringLiteral("status-warning"), QStringLiteral("table"),
    QStringLiteral("theme"),        QStringLiteral("zoom-100"),       QStringLiteral("zoom-fit"),
    QStringLiteral("zoom-in"),      QStringLiteral("zoom-out"),
};

/// The one icon in several colours and stroke widths: windows and launchers show it as it is.
const QString applicationIcon = QStringLiteral("measuringdesk");

constexpr int gridExtent = 24;
constexpr int smallestExtent = 16;

QString nameOf(const QString &path)
{
    return SourceTree::fileName(path).section(QLatin1Char('.'), 0, 0);
}

/// Drawn to be shown at this size next to a line of text.
bool isArrow(const QString &path)
{
    return nameOf(path).startsWith(QLatin1String("arrow-"));
}

QSize gridSize(const QString &path)
{
    return isArrow(path) ? QSize(11, 7) : QSize(gridExtent, gridExtent);
}

/// All are tinted but the application's; a missing picture's is grey, for paper is white in every theme.
QString strokeColor(const QString &path)
{
    if (nameOf(path) == applicationIcon)
        return QStringLiteral("#ffffff");
    return nameOf(path) == QLatin1String("EmptyImage") ? QStringLiteral("#8a8f94")
                                                       : QStringLiteral("#000000");
}

/// The files of a resource list as their users see them, without the leading ":".
QStringList listedFiles(const QString &qrcText)
{
    QStringList files;
    QString prefix;
    QXmlStreamReader reader(qrcText);
    while (!reader.atEnd()) {
        reader.readNext();
        if (!reader.isStartElement())
            continue;
        if (reader.name() == QLatin1String("qresource"))
            prefix = reader.attributes().value(QLatin1String("prefix")).toString();
        else if (reader.name() == QLatin1String("file"))
            files.append(QDir::cleanPath(prefix + QLatin1Char('/') + reader.readElementText()));
    }
    return reader.hasError() ? QStringList() : files;
}

/// Names behind "Icons/" in the text literals of a source, a form or a style sheet.
QStringList usedNames(const QString &text)
{
    static const QRegularExpression pattern(QStringLiteral("[\"(>/]Icons/([\\w-]+)(?:\\.svg)?[\")<]"));
    QStringList names;
    QRegularExpressionMatchIterator it = pattern.globalMatch(text);
    while (it.hasNext())
        names.append(it.next().captured(1));
    return names;
}

/// Values of an attribute in document order, with those inside \c style attributes.
QStringList attributeValues(const QString &svgText, const QString &attribute)
{
    const QRegularExpression pattern(
        QStringLiteral("(?<![\\w-])%1\\s*(?:=\\s*\"([^\"]*)\"|:\\s*([^;\"]+))").arg(attribute));
    QStringList values;
    QRegularExpressionMatchIterator it = pattern.globalMatch(svgText);
    while (it.hasNext()) {
        const QRegularExpressionMatch match = it.next();
        values.append(match.captured(1) + match.captured(2));
    }
    return values;
}

QImage rendered(const QString &file, const QSize &size)
{
    QSvgRenderer renderer(file);
    renderer.setAspectRatioMode(Qt::KeepAspectRatio);
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    renderer.render(&painter);
    return image;
}

/// Whether a frame of one grid unit around the drawing is left blank.
bool isInsideBorder(const QImage &image, int unit)
{
    const QRect inner = image.rect().adjusted(unit, unit, -unit, -unit);
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (!inner.contains(x, y) && qAlpha(image.pixel(x, y)) != 0)
                return false;
        }
    }
    return true;
}

/// Covered area in pixels; partly covered ones count partly.
double coverage(const QImage &image)
{
    double sum = 0.0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            sum += qAlpha(image.pixel(x, y)) / 255.0;
    }
    return sum;
}

/// Area in pixels in which two drawings of the same size differ.
double difference(const QImage &a, const QImage &b)
{
    double sum = 0.0;
    for (int y = 0; y < a.height(); ++y) {
        for (int x = 0; x < a.width(); ++x)
            sum += std::abs(qAlpha(a.pixel(x, y)) - qAlpha(b.pixel(x, y))) / 255.0;
    }
    return sum;
}

QByteArray lines(const QStringList &texts)
{
    return '\n' + texts.join(QLatin1Char('\n')).toUtf8();
}

} // namespace

class IconsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();

    void readsResourceLists();
    void readsUsedNames_data();
    void readsUsedNames();
    void readsAttributes();
    void measuresDrawings();

    void theNamesAreComplete_data();
    void theNamesAreComplete();
    void theListIsTheFolder_data();
    void theListIsTheFolder();
    void noNameIsTakenTwice();
    void everyUsedIconExists_data();
    void everyUsedIconExists();

    void isAnIcon_data();
    void isAnIcon();
    void isDrawnLikeTheOthers_data();
    void isDrawnLikeTheOthers();
    void keepsItsDistance_data();
    void keepsItsDistance();
    void isSeenAtItsSmallest_data();
    void isSeenAtItsSmallest();
    void areToldApart();

private:
    static void addSets();
    void addIcons(bool withApplicationIcon = true) const;

    SourceTree::Files m_icons;
};

void IconsTest::initTestCase()
{
    m_icons = SourceTree::read(
        sourcePath(QString()),
        {reportIcons.folder + QStringLiteral("/Icons"), deskIcons.folder + QStringLiteral("/Icons")},
        {QStringLiteral("*")});
    QVERIFY(!m_icons.isEmpty());
}

void IconsTest::addSets()
{
    QTest::addColumn<QString>("folder");
    QTest::addColumn<QString>("resourceList");
    QTest::addColumn<QString>("users");
    QTest::addColumn<QStringList>("names");
    QTest::newRow("report") << reportIcons.folder << reportIcons.resourceList << reportIcons.users
                            << reportNames;
    QTest::newRow("desk") << deskIcons.folder << deskIcons.resourceList << deskIcons.users << deskNames;
}

void IconsTest::addIcons(bool withApplicationIcon) const
{
    QTest::addColumn<QString>("path");
    for (auto it = m_icons.constBegin(); it != m_icons.constEnd(); ++it) {
        if (withApplicationIcon || nameOf(it.key()) != applicationIcon)
            QTest::newRow(qUtf8Printable(it.key())) << it.key();
    }
}

void IconsTest::readsResourceLists()
{
    const QString list = QStringLiteral("<!-- a --><RCC><qresource prefix=\"%1\"><file>Icons/a.svg</file>"
                                        "<!-- <file>Icons/b.svg</file> --></qresource></RCC>");
    QCOMPARE(listedFiles(list.arg(QStringLiteral("/"))), QStringList(QStringLiteral("/Icons/a.svg")));
    QCOMPARE(listedFiles(list.arg(QStringLiteral("/b"))), QStringList(QStringLiteral("/b/Icons/a.svg")));
    QCOMPARE(listedFiles(list.chopped(1)), QStringList());
}

void IconsTest::readsUsedNames_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QStringList>("names");
    const QStringList open(QStringLiteral("open"));
    QTest::newRow("plain") << QStringLiteral("f(\"Icons/open\")") << open;
    QTest::newRow("suffix") << QStringLiteral("f(\"Icons/open.svg\")") << open;
    QTest::newRow("resource") << QStringLiteral("f(\":/Icons/open.svg\")") << open;
    QTest::newRow("style sheet") << QStringLiteral("image: url(:/Icons/open.svg);") << open;
    QTest::newRow("form") << QStringLiteral("<iconset>:/Icons/open.svg</iconset>") << open;
    QTest::newRow("hyphen, two") << QStringLiteral("{\"Icons/save-as\", \"Icons/open\"}")
                                 << QStringList{QStringLiteral("save-as"), QStringLiteral("open")};
    QTest::newRow("put together") << QStringLiteral("\"Icons/\" + name") << QStringList();
    QTest::newRow("other folder") << QStringLiteral("\"NoIcons/open\"") << QStringList();
}

void IconsTest::readsUsedNames()
{
    QFETCH(QString, text);
    QFETCH(QStringList, names);
    QCOMPARE(usedNames(text), names);
}

void IconsTest::readsAttributes()
{
    const QString svg =
        QStringLiteral("<svg stroke=\"#000\" stroke-width=\"1.75\">"
                       "<path stroke-width=\"2\"/><path style=\"stroke-width: 3;fill:#fff\"/>");
    QCOMPARE(attributeValues(svg, QStringLiteral("stroke-width")),
             (QStringList{QStringLiteral("1.75"), QStringLiteral("2"), QStringLiteral("3")}));
    QCOMPARE(attributeValues(svg, QStringLiteral("stroke")), QStringList(QStringLiteral("#000")));
    QCOMPARE(attributeValues(svg, QStringLiteral("fill")), QStringList(QStringLiteral("#fff")));
    QCOMPARE(attributeValues(svg, QStringLiteral("width")), QStringList());
}

void IconsTest::measuresDrawings()
{
    QImage blank(4, 4, QImage::Format_ARGB32_Premultiplied);
    blank.fill(Qt::transparent);
    QCOMPARE(coverage(blank), 0.0);
    QVERIFY(isInsideBorder(blank, 1));

    QImage inside = blank;
    inside.setPixel(1, 2, qRgba(0, 0, 0, 255));
    QCOMPARE(coverage(inside), 1.0);
    QVERIFY(isInsideBorder(inside, 1));
    QVERIFY(!isInsideBorder(inside, 2));

    QImage outside = inside;
    outside.setPixel(3, 2, qRgba(0, 0, 0, 51));
    QVERIFY(!isInsideBorder(outside, 1));
    QCOMPARE(difference(inside, inside), 0.0);
    QCOMPARE(difference(inside, outside), 0.2);
    QCOMPARE(difference(blank, outside), 1.2);
}

void IconsTest::theNamesAreComplete_data()
{
    addSets();
}

void IconsTest::theNamesAreComplete()
{
    QFETCH(QString, folder);
    QFETCH(QStringList, names);
    QStringList missing;
    for (const QString &name : names) {
        const QString path = QStringLiteral("%1/Icons/%2.svg").arg(folder, name);
        if (!m_icons.contains(path))
            missing.append(path);
    }
    QVERIFY2(missing.isEmpty(), lines(missing));
}

void IconsTest::theListIsTheFolder_data()
{
    addSets();
}

void IconsTest::theListIsTheFolder()
{
    QFETCH(QString, folder);
    QFETCH(QString, resourceList);
    const SourceTree::Files lists =
        SourceTree::read(sourcePath(QString()), {folder}, {SourceTree::fileName(resourceList)});
    QStringList listed = listedFiles(lists.value(resourceList));
    QStringList present;
    for (const QString &path : m_icons.keys()) {
        if (path.startsWith(folder + QLatin1Char('/')))
            present.append(path.mid(folder.size()));
    }
    listed.sort();
    present.sort();
    QVERIFY(!present.isEmpty());
    QCOMPARE(listed, present);
}

void IconsTest::noNameIsTakenTwice()
{
    // Plug-in and Desk run in one process, where both lists are one folder.
    QStringList names;
    for (const QString &path : m_icons.keys())
        names.append(SourceTree::fileName(path));
    names.sort(Qt::CaseInsensitive);
    const auto twice =
        std::adjacent_find(names.cbegin(), names.cend(),
                           [](const QString &a, const QString &b) { return a.toLower() == b.toLower(); });
    QVERIFY2(twice == names.cend(), qUtf8Printable(twice == names.cend() ? QString() : *twice));
}

void IconsTest::everyUsedIconExists_data()
{
    addSets();
}

void IconsTest::everyUsedIconExists()
{
    QFETCH(QString, folder);
    QFETCH(QString, users);
    const SourceTree::Files sources =
        SourceTree::read(sourcePath(QString()), {users},
                         {QStringLiteral("*.h"), QStringLiteral("*.cpp"), QStringLiteral("*.ui"),
                          QStringLiteral("*.qss"), QStringLiteral("*.in")});
    QStringList missing;
    int used = 0;
    for (auto it = sources.constBegin(); it != sources.constEnd(); ++it) {
        for (const QString &name : usedNames(SourceTree::withoutComments(it.value()))) {
            ++used;
            if (!m_icons.contains(QStringLiteral("%1/Icons/%2.svg").arg(folder, name)))
                missing.append(QStringLiteral("%1 uses %2").arg(it.key(), name));
        }
    }
    QVERIFY(used > 0);
    QVERIFY2(missing.isEmpty(), lines(missing));
}

void IconsTest::isAnIcon_data()
{
    addIcons();
}

void IconsTest::isAnIcon()
{
    QFETCH(QString, path);
    const QSize size = gridSize(path);
    const QSvgRenderer renderer(sourcePath(path));
    QVERIFY(renderer.isValid());
    QVERIFY(!renderer.animated());
    QCOMPARE(renderer.viewBoxF(), QRectF(QPointF(0, 0), size));
    QCOMPARE(renderer.defaultSize(), size);

    const QStringList text = m_icons.value(path).split(QLatin1Char('\n'));
    QVERIFY(text.first().startsWith(QLatin1String("<svg xmlns=\"http://www.w3.org/2000/svg\" ")));
    QCOMPARE(text.value(1), QStringLiteral("  <!-- SPDX-License-Identifier: MIT -->"));
}

void IconsTest::isDrawnLikeTheOthers_data()
{
    addIcons(false);
}

void IconsTest::isDrawnLikeTheOthers()
{
    QFETCH(QString, path);
    const QString text = m_icons.value(path);
    const QString color = strokeColor(path);
    const QString none = QStringLiteral("none");
    const QString round = QStringLiteral("round");
    QCOMPARE(attributeValues(text, QStringLiteral("stroke-width")), QStringList(QStringLiteral("1.75")));
    QCOMPARE(attributeValues(text, QStringLiteral("stroke-linecap")), QStringList(round));
    QCOMPARE(attributeValues(text, QStringLiteral("stroke-linejoin")), QStringList(round));
    for (const char *attribute :
         {"opacity", "stroke-opacity", "fill-opacity", "stroke-dasharray", "transform"})
        QCOMPARE(attributeValues(text, QLatin1String(attribute)), QStringList());

    const QStringList strokes = attributeValues(text, QStringLiteral("stroke"));
    QCOMPARE(strokes.first(), color);
    for (const QString &stroke : strokes.mid(1))
        QCOMPARE(stroke, none); // dots are filled
    const QStringList fills = attributeValues(text, QStringLiteral("fill"));
    QCOMPARE(fills.first(), none);
    for (const QString &fill : fills.mid(1))
        QCOMPARE(fill, color);
}

void IconsTest::keepsItsDistance_data()
{
    addIcons();
}

void IconsTest::keepsItsDistance()
{
    QFETCH(QString, path);
    // Arrows fill their few pixels; what matters is that none of their ends is cut off.
    constexpr int arrowScale = 8;
    const QImage image = rendered(sourcePath(path), gridSize(path) * (isArrow(path) ? arrowScale : 1));
    QVERIFY(isInsideBorder(image, 1));
}

void IconsTest::isSeenAtItsSmallest_data()
{
    addIcons();
}

void IconsTest::isSeenAtItsSmallest()
{
    QFETCH(QString, path);
    const QSize size = isArrow(path) ? gridSize(path) : QSize(smallestExtent, smallestExtent);
    constexpr double leastCoverage = 10.0; // of 256 pixels
    const double covered = coverage(rendered(sourcePath(path), size));
    QVERIFY2(covered >= leastCoverage, QByteArray::number(covered));
}

void IconsTest::areToldApart()
{
    constexpr double leastDifference = 4.0; // pixels of 256
    QMap<QString, QImage> images;
    for (const QString &path : m_icons.keys())
        images.insert(path, rendered(sourcePath(path), QSize(smallestExtent, smallestExtent)));
    QStringList alike;
    for (auto a = images.constBegin(); a != images.constEnd(); ++a) {
        for (auto b = std::next(a); b != images.constEnd(); ++b) {
            const double differing = difference(a.value(), b.value());
            if (differing < leastDifference)
                alike.append(QStringLiteral("%1, %2: %3").arg(a.key(), b.key()).arg(differing));
        }
    }
    QVERIFY2(alike.isEmpty(), lines(alike));
}

STATREPORT_TEST_MAIN(IconsTest)
#include "IconsTest.moc"
