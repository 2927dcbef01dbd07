// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "gui/QtAdvancedStylesheet.h"

#include <QApplication>
#include <QtWidgets>

using acss::QtAdvancedStylesheet;

namespace {

/// One of every kind of control, in every state that can be set.
void fill(QWidget *window)
{
    auto *const layout = new QVBoxLayout(window);
    const QList<QWidget *> controls{new QPushButton(QStringLiteral("Push")),
                                    new QToolButton,
                                    new QCheckBox(QStringLiteral("Check")),
                                    new QRadioButton(QStringLiteral("Radio")),
                                    new QLineEdit,
                                    new QComboBox,
                                    new QSpinBox,
                                    new QDoubleSpinBox,
                                    new QSlider(Qt::Horizontal),
                                    new QSlider(Qt::Vertical),
                                    new QProgressBar,
                                    new QScrollBar,
                                    new QGroupBox(QStringLiteral("Group")),
                                    new QLabel(QStringLiteral("Label")),
                                    new QTabBar,
                                    new QSplitter,
                                    new QMenuBar,
                                    new QStatusBar,
                                    new QToolBar,
                                    new QTableWidget(2, 2),
                                    new QTreeWidget,
                                    new QTextEdit};
    for (QWidget *const control : controls)
        layout->addWidget(control);
}

/// A character that looks different in each of the languages that have it.
const QString han = QStringLiteral("\u76F4");

QString drawnWith(const QFont &font, const QString &text)
{
    QTextLayout layout(text, font);
    layout.beginLayout();
    layout.createLine();
    layout.endLayout();
    // Substitutes are named in small letters.
    return layout.glyphRuns().value(0).rawFont().familyName().toLower();
}

double relativeLuminance(const QColor &color)
{
    const auto linear = [](double c) {
        return c <= 0.03928 ? c / 12.92 : std::pow((c + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) + 0.0722 * linear(color.blueF());
}

double contrast(const QColor &a, const QColor &b)
{
    const double la = relativeLuminance(a);
    const double lb = relativeLuminance(b);
    return (std::max(la, lb) + 0.05) / (std::min(la, lb) + 0.05);
}

} // namespace

class QtAdvancedStylesheetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanupTestCase();
    void startsDark();
    void hasTwoThemes();
    void changesAreAnnounced();
    void unknownThemesAreRefused_data();
    void unknownThemesAreRefused();
    void colors_data();
    void colors();
    void unknownColorsAreInvalid();
    void textsAreReadable_data();
    void textsAreReadable();
    void messageIconsAreOfTheTheme_data();
    void messageIconsAreOfTheTheme();
    void fileDialogIconsAreOfTheTheme_data();
    void fileDialogIconsAreOfTheTheme();
    void backPointsWhereReadingComesFrom();
    void messageBoxesFollowTheTheme();
    void charactersHaveTheLanguagesForms_data();
    void charactersHaveTheLanguagesForms();
    void latinLettersAreTheSameInEveryLanguage();
    void theStyleSheetIsFilledIn_data();
    void theStyleSheetIsFilledIn();
    void theStyleSheetSuitsItsParser_data();
    void theStyleSheetSuitsItsParser();
    void controlsAreEquallyHigh();
    void applyingGivesFontAndPalette();
    void applyingToNothing();
    void freeFontsStandIn();

private:
    QtAdvancedStylesheet *m_style = QtAdvancedStylesheet::getInstance();
};

void QtAdvancedStylesheetTest::init()
{
    StatReportTest::init();
    m_style->setCurrentTheme(QStringLiteral("Dark"));
}

void QtAdvancedStylesheetTest::cleanupTestCase()
{
    qApp->setStyleSheet(QString());
}

void QtAdvancedStylesheetTest::startsDark()
{
    QCOMPARE(m_style->currentTheme(), QStringLiteral("Dark"));
}

void QtAdvancedStylesheetTest::hasTwoThemes()
{
    QCOMPARE(m_style->themes(), QStringList({QStringLiteral("Dark"), QStringLiteral("Light")}));
}

void QtAdvancedStylesheetTest::changesAreAnnounced()
{
    QSignalSpy changed(m_style, SIGNAL(currentThemeChanged(QString)));
    QVERIFY(m_style->setCurrentTheme(QStringLiteral("Dark")));
    QCOMPARE(changed.count(), 0);
    QVERIFY(m_style->setCurrentTheme(QStringLiteral("Light")));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(changed.at(0).at(0).toString(), QStringLiteral("Light"));
    QCOMPARE(m_style->currentTheme(), QStringLiteral("Light"));
}

void QtAdvancedStylesheetTest::unknownThemesAreRefused_data()
{
    QTest::addColumn<QString>("theme");
    QTest::newRow("empty") << QString();
    QTest::newRow("letter case") << QStringLiteral("light");
    QTest::newRow("other") << QStringLiteral("Pink");
}

void QtAdvancedStylesheetTest::unknownThemesAreRefused()
{
    QFETCH(QString, theme);
    QSignalSpy changed(m_style, SIGNAL(currentThemeChanged(QString)));
    QVERIFY(!m_style->setCurrentTheme(theme));
    QCOMPARE(changed.count(), 0);
    QCOMPARE(m_style->currentTheme(), QStringLiteral("Dark"));
}

void QtAdvancedStylesheetTest::colors_data()
{
    QTest::addColumn<QString>("token");
    QTest::addColumn<QString>("dark");
    QTest::addColumn<QString>("light");
    const auto row = [](const char *token, const char *dark, const char *light) {
        QTest::newRow(token) << QString::fromLatin1(token) << QString::fromLatin1(dark)
                             << QString::fromLatin1(light);
    };
    row("window", "#1f2123", "#f3f4f5");
    row("panel", "#262626", "#ffffff");
    row("raised", "#313131", "#ffffff");
    row("line", "#4d4d4d", "#dcdcdc");
    row("text", "#f0f0f1", "#141414");
    row("muted", "#b4b7ba", "#5b5f63");
    row("accent", "#00659d", "#00659d");
    row("accent-hover", "#0a7cbb", "#0a7cbb");
    row("accent-pressed", "#004f7c", "#004f7c");
    row("on-accent", "#ffffff", "#ffffff");
    row("danger", "#f0b1b5", "#f0b1b5");
    row("danger-hover", "#a61d24", "#a61d24");
    row("danger-pressed", "#e84749", "#e84749");
    row("on-danger-pressed", "#141414", "#141414");
    row("ok", "#60bd65", "#226a25");
    row("warning", "#ffc107", "#936600");
    row("text-disabled", "#66f0f0f1", "#66141414");
    row("accent-disabled", "#6600659d", "#6600659d");
    row("on-accent-disabled", "#66ffffff", "#66ffffff");
}

void QtAdvancedStylesheetTest::colors()
{
    QFETCH(QString, token);
    QFETCH(QString, dark);
    QFETCH(QString, light);
    QCOMPARE(m_style->color(token), QColor(dark));
    m_style->setCurrentTheme(QStringLiteral("Light"));
    QCOMPARE(m_style->color(token), QColor(light));
}

void QtAdvancedStylesheetTest::unknownColorsAreInvalid()
{
    QVERIFY(!m_style->color(QStringLiteral("no-such-colour")).isValid());
    QVERIFY(!m_style->color(QString()).isValid());
}

void QtAdvancedStylesheetTest::textsAreReadable_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("background");
    for (const char *const text : {"text", "muted"}) {
        for (const char *const background : {"window", "panel", "raised", "raised-hover", "raised-pressed"})
            QTest::addRow("%s on %s", text, background)
                << QString::fromLatin1(text) << QString::fromLatin1(background);
    }
    for (const char *const background : {"accent", "accent-hover", "accent-pressed", "danger-hover"})
        QTest::addRow("on-accent on %s", background)
            << QStringLiteral("on-accent") << QString::fromLatin1(background);
    for (const char *const text : {"ok", "warning"}) {
        for (const char *const background : {"window", "panel", "raised"})
            QTest::addRow("%s on %s", text, background)
                << QString::fromLatin1(text) << QString::fromLatin1(background);
    }
    QTest::addRow("on-danger-pressed on danger-pressed")
        << QStringLiteral("on-danger-pressed") << QStringLiteral("danger-pressed");
}

void QtAdvancedStylesheetTest::textsAreReadable()
{
    QFETCH(QString, text);
    QFETCH(QString, background);
    for (const QString &theme : m_style->themes()) {
        m_style->setCurrentTheme(theme);
        const double ratio = contrast(m_style->color(text), m_style->color(background));
        QVERIFY2(ratio >= 4.5, qPrintable(QStringLiteral("%1: %2:1").arg(theme).arg(ratio)));
    }
}

void QtAdvancedStylesheetTest::messageIconsAreOfTheTheme_data()
{
    QTest::addColumn<int>("icon");
    QTest::addColumn<QString>("token");
    QTest::newRow("question") << int(QStyle::SP_MessageBoxQuestion) << "accent-hover";
    QTest::newRow("information") << int(QStyle::SP_MessageBoxInformation) << "accent-hover";
    QTest::newRow("warning") << int(QStyle::SP_MessageBoxWarning) << "warning";
    QTest::newRow("critical") << int(QStyle::SP_MessageBoxCritical) << "error";
}

/// In the colour of their meaning, which stands out from the dialog; at any size of pixels.
void QtAdvancedStylesheetTest::messageIconsAreOfTheTheme()
{
    QFETCH(int, icon);
    QFETCH(QString, token);
    auto *const service = QtAdvancedStylesheet::getInstance();
    for (const QString &theme : service->themes()) {
        service->setCurrentTheme(theme);
        service->applyTo(qApp);
        const QStyle *const style = QApplication::style();
        QCOMPARE(style->pixelMetric(QStyle::PM_MessageBoxIconSize), 40);
        const QImage image =
            style->standardIcon(static_cast<QStyle::StandardPixmap>(icon)).pixmap(80, 80).toImage();
        QCOMPARE(image.size(), QSize(80, 80));
        int strokes = 0;
        for (int y = 0; y < image.height(); ++y) {
            for (int x = 0; x < image.width(); ++x) {
                if (image.pixelColor(x, y).alpha() != 255)
                    continue;
                QCOMPARE(image.pixelColor(x, y), service->color(token));
                ++strokes;
            }
        }
        QVERIFY(strokes > 200);
        QVERIFY2(contrast(service->color(token), service->color(QStringLiteral("window"))) >= 3.0,
                 qPrintable(theme));
    }
}

void QtAdvancedStylesheetTest::fileDialogIconsAreOfTheTheme_data()
{
    QTest::addColumn<int>("icon");
    const QMetaEnum icons = QMetaEnum::fromType<QStyle::StandardPixmap>();
    for (const char *name : {"SP_ArrowBack",
                             "SP_ArrowForward",
                             "SP_FileDialogBack",
                             "SP_FileDialogToParent",
                             "SP_FileDialogNewFolder",
                             "SP_FileDialogListView",
                             "SP_FileDialogDetailedView",
                             "SP_DirIcon",
                             "SP_DirOpenIcon",
                             "SP_DirClosedIcon",
                             "SP_DirLinkIcon",
                             "SP_DirHomeIcon",
                             "SP_FileIcon",
                             "SP_FileLinkIcon",
                             "SP_ComputerIcon",
                             "SP_DesktopIcon",
                             "SP_DriveHDIcon",
                             "SP_DriveFDIcon",
                             "SP_DriveNetIcon",
                             "SP_DriveCDIcon",
                             "SP_DriveDVDIcon",
                             "SP_TrashIcon"})
        QTest::newRow(name) << icons.keyToValue(name);
}

/// Strokes of one colour, as the icons of the application.
void QtAdvancedStylesheetTest::fileDialogIconsAreOfTheTheme()
{
    QFETCH(int, icon);
    auto *const service = QtAdvancedStylesheet::getInstance();
    for (const QString &theme : service->themes()) {
        service->setCurrentTheme(theme);
        service->applyTo(qApp);
        const QColor text = service->color(QStringLiteral("text"));
        const QImage image = QApplication::style()
                                 ->standardIcon(static_cast<QStyle::StandardPixmap>(icon))
                                 .pixmap(48, 48)
                                 .toImage();
        QVERIFY(!image.isNull());
        int strokes = 0;
        for (int y = 0; y < image.height(); ++y) {
            for (int x = 0; x < image.width(); ++x) {
                if (image.pixelColor(x, y).alpha() != 255)
                    continue;
                QCOMPARE(image.pixelColor(x, y), text);
                ++strokes;
            }
        }
        QVERIFY2(strokes > 30 && strokes < image.width() * image.height() / 2,
                 qPrintable(QString::number(strokes)));
    }
}

void QtAdvancedStylesheetTest::backPointsWhereReadingComesFrom()
{
    QtAdvancedStylesheet::getInstance()->applyTo(qApp);
    const auto image = [](QStyle::StandardPixmap icon, Qt::LayoutDirection direction) {
        QWidget widget;
        widget.setLayoutDirection(direction);
        return QApplication::style()->standardIcon(icon, nullptr, &widget).pixmap(24, 24).toImage();
    };
    const QImage left = image(QStyle::SP_ArrowBack, Qt::LeftToRight);
    const QImage right = image(QStyle::SP_ArrowForward, Qt::LeftToRight);
    QVERIFY(left != right);
    QCOMPARE(image(QStyle::SP_ArrowBack, Qt::RightToLeft), right);
    QCOMPARE(image(QStyle::SP_FileDialogBack, Qt::RightToLeft), right);
    QCOMPARE(image(QStyle::SP_ArrowForward, Qt::RightToLeft), left);
    QCOMPARE(image(QStyle::SP_DirIcon, Qt::RightToLeft), image(QStyle::SP_DirIcon, Qt::LeftToRight));
}

void QtAdvancedStylesheetTest::messageBoxesFollowTheTheme()
{
    auto *const service = QtAdvancedStylesheet::getInstance();
    service->setCurrentTheme(QStringLiteral("Dark"));
    service->applyTo(qApp);
    QMessageBox box(QMessageBox::Warning, QStringLiteral("Title"), QStringLiteral("Text"), QMessageBox::Ok);
    box.show();
    QVERIFY(QTest::qWaitForWindowExposed(&box));
    const QImage dark = box.iconPixmap().toImage();
    QCOMPARE(dark.size(), QSize(40, 40));
    service->setCurrentTheme(QStringLiteral("Light"));
    service->applyTo(qApp);
    QTRY_VERIFY(box.iconPixmap().toImage() != dark);
}

void QtAdvancedStylesheetTest::charactersHaveTheLanguagesForms_data()
{
    QTest::addColumn<QLocale>("language");
    QTest::addColumn<QString>("family");
    QTest::newRow("simplified") << QLocale(QLocale::Chinese, QLocale::China) << "Noto Sans CJK SC";
    QTest::newRow("traditional") << QLocale(QLocale::Chinese, QLocale::Taiwan) << "Noto Sans CJK TC";
    QTest::newRow("Japanese") << QLocale(QLocale::Japanese) << "Noto Sans CJK JP";
    QTest::newRow("Korean") << QLocale(QLocale::Korean) << "Noto Sans CJK KR";
}

void QtAdvancedStylesheetTest::charactersHaveTheLanguagesForms()
{
    QFETCH(QLocale, language);
    QFETCH(QString, family);
    auto *const service = QtAdvancedStylesheet::getInstance();
    service->setLanguage(language);
    service->applyTo(qApp);
    QFont font = QApplication::font();
    // A program has one language: fonts of the same size would be those of the language before.
    font.setPixelSize(30 + family.back().unicode() % 32 + family.at(family.size() - 2).unicode() % 32);
    QCOMPARE(drawnWith(font, han), family.toLower());
    // The style sheet names fonts of its own.
    QWidget window;
    auto *const layout = new QVBoxLayout(&window);
    for (QWidget *const control :
         std::initializer_list<QWidget *>{new QPushButton(han), new QLabel(han), new QLineEdit(han)}) {
        layout->addWidget(control);
        control->ensurePolished();
        QVERIFY2(control->font().families().contains(family), control->metaObject()->className());
    }
    service->setLanguage(QLocale::c());
}

void QtAdvancedStylesheetTest::latinLettersAreTheSameInEveryLanguage()
{
    auto *const service = QtAdvancedStylesheet::getInstance();
    const QString text = QStringLiteral("Length");
    service->setLanguage(QLocale::c());
    service->applyTo(qApp);
    const QString family = drawnWith(QApplication::font(), text);
    for (const QLocale::Language language : {QLocale::Chinese, QLocale::Japanese, QLocale::Korean}) {
        service->setLanguage(language);
        service->applyTo(qApp);
        QCOMPARE(drawnWith(QApplication::font(), text), family);
    }
    service->setLanguage(QLocale::c());
    service->applyTo(qApp);
    QCOMPARE(QApplication::font().families(), QStringList());
}

void QtAdvancedStylesheetTest::theStyleSheetIsFilledIn_data()
{
    QTest::addColumn<QString>("theme");
    QTest::addColumn<QString>("window");
    QTest::newRow("dark") << QStringLiteral("Dark") << QStringLiteral("#1f2123");
    QTest::newRow("light") << QStringLiteral("Light") << QStringLiteral("#f3f4f5");
}

void QtAdvancedStylesheetTest::theStyleSheetIsFilledIn()
{
    QFETCH(QString, theme);
    QFETCH(QString, window);
    m_style->setCurrentTheme(theme);
    const QString sheet = m_style->styleSheet();
    QVERIFY(!sheet.isEmpty());
    QVERIFY(!sheet.contains(QLatin1String("{{")));
    QVERIFY(!sheet.contains(QLatin1String("}}")));
    QVERIFY(sheet.contains(window));
    QVERIFY(sheet.contains(QLatin1String("font-family: \"Segoe UI\";")));
    QVERIFY(sheet.contains(QLatin1String("font-size: 13px;")));
    QVERIFY(sheet.contains(QLatin1String("rgba(0, 101, 157, 102)")));

    const QRegularExpression url(QStringLiteral("url\\(\"([^\"]+)\"\\)"));
    for (auto match = url.globalMatch(sheet); match.hasNext();) {
        const QString image = match.next().captured(1);
        QVERIFY2(QFile::exists(image), qPrintable(image));
    }
    // A colour name that does not exist leaves a hole.
    QVERIFY(!sheet.contains(QRegularExpression(QStringLiteral(":\\s*;"))));
    QVERIFY(!sheet.contains(QLatin1String("solid ;")));
    QVERIFY(!sheet.contains(QLatin1String("#000000")));
}

void QtAdvancedStylesheetTest::theStyleSheetSuitsItsParser_data()
{
    QTest::addColumn<QString>("theme");
    QTest::newRow("dark") << QStringLiteral("Dark");
    QTest::newRow("light") << QStringLiteral("Light");
}

/// The parser and the drawing speak up through Qt warnings, which fail the test.
void QtAdvancedStylesheetTest::theStyleSheetSuitsItsParser()
{
    QFETCH(QString, theme);
    m_style->setCurrentTheme(theme);
    m_style->applyTo(qApp);
    QMainWindow window;
    auto *const content = new QWidget;
    fill(content);
    window.setCentralWidget(content);
    window.addDockWidget(Qt::LeftDockWidgetArea, new QDockWidget(QStringLiteral("Dock")));
    window.resize(400, 900);
    const QImage enabled = window.grab().toImage();
    QCOMPARE(enabled.pixelColor(enabled.width() - 1, enabled.height() - 1),
             m_style->color(QStringLiteral("window")));
    content->setEnabled(false);
    QVERIFY(window.grab().toImage() != enabled);
}

void QtAdvancedStylesheetTest::controlsAreEquallyHigh()
{
    m_style->applyTo(qApp);
    QWidget window;
    auto *const layout = new QHBoxLayout(&window);
    const QList<QWidget *> controls{new QPushButton(QStringLiteral("Push")), new QLineEdit, new QComboBox,
                                    new QSpinBox, new QDoubleSpinBox};
    for (QWidget *const control : controls)
        layout->addWidget(control);
    window.grab(); // lays out
    for (const QWidget *const control : controls)
        QVERIFY2(control->height() == 28,
                 qPrintable(QStringLiteral("%1: %2")
                                .arg(QLatin1String(control->metaObject()->className()))
                                .arg(control->height())));
}

void QtAdvancedStylesheetTest::applyingGivesFontAndPalette()
{
    m_style->applyTo(qApp);
    QCOMPARE(QApplication::font().family(), QStringLiteral("Segoe UI"));
    QCOMPARE(QApplication::font().pixelSize(), 13);
    QCOMPARE(QApplication::palette().color(QPalette::Window), m_style->color(QStringLiteral("window")));
    QCOMPARE(QApplication::palette().color(QPalette::WindowText), m_style->color(QStringLiteral("text")));
    QCOMPARE(QApplication::palette().color(QPalette::Highlight), m_style->color(QStringLiteral("accent")));
    QCOMPARE(QApplication::palette().color(QPalette::Disabled, QPalette::Text),
             m_style->color(QStringLiteral("text-disabled")));
    QCOMPARE(qApp->styleSheet(), m_style->styleSheet());
}

void QtAdvancedStylesheetTest::applyingToNothing()
{
    const QString before = qApp->styleSheet();
    m_style->applyTo(nullptr);
    QCOMPARE(qApp->styleSheet(), before);
}

void QtAdvancedStylesheetTest::freeFontsStandIn()
{
    QFont::removeSubstitutions(QStringLiteral("Segoe UI"));
    QtAdvancedStylesheet::substituteFonts();
    QtAdvancedStylesheet::substituteFonts();
    QCOMPARE(QFont::substitutes(QStringLiteral("Segoe UI")),
             QStringList(
                 {QStringLiteral("open sans"), QStringLiteral("noto sans"), QStringLiteral("dejavu sans")}));
}

STATREPORT_TEST_MAIN(QtAdvancedStylesheetTest)
#include "QtAdvancedStylesheetTest.moc"
