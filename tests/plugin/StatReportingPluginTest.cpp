// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "common/ZtAppStatus.h"
#include "gui/KvGuiMainWindowBase.h"
#include "gui/KvToolBase.h"
#include "gui/QtAdvancedStylesheet.h"
#include "gui/ZtPluginInterface.h"
#include "gui/acss.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtSignalCenter.h"
#include "support/BracketTranslator.h"
#include "support/FileDialogAnswerer.h"
#include "support/MessageBoxAnswerer.h"
#include "support/MetaMethods.h"

#include <QComboBox>
#include <QJsonObject>
#include <QLabel>
#include <QLayout>
#include <QLibrary>
#include <QPluginLoader>
#include <QProcess>
#include <QRegularExpression>
#include <QToolButton>

#include <memory>

namespace {

const QString toolGroup = QStringLiteral("Statistics tools");
const QSize iconSize(32, 24);
const char *const buttonNames[] = {"theEditorButton", "theExportButton", "theStatisticsButton",
                                   "theBrowseButton"};
const char *const iconPaths[] = {"Icons/editor", "Icons/export-pdf", "Icons/statwin", "Icons/browse"};

void store(const QString &key, const QVariant &value)
{
    ZtAppSettings::beginGroup(QStringLiteral("StatReporting"));
    ZtAppSettings::setValue(key, value);
    ZtAppSettings::endGroup();
}

QVariant stored(const QString &key)
{
    ZtAppSettings::beginGroup(QStringLiteral("StatReporting"));
    const QVariant value = ZtAppSettings::value(key);
    ZtAppSettings::endGroup();
    return value;
}

QImage iconImage(const QIcon &icon)
{
    return icon.pixmap(iconSize).toImage();
}

QImage expectedIcon(const char *path)
{
    return iconImage(acss::createIcon(6, QLatin1String(path), iconSize));
}

QString writeFile(const QString &path, const QByteArray &text)
{
    QDir().mkpath(QFileInfo(path).absolutePath());
    QFile file(path);
    if (file.open(QIODevice::WriteOnly))
        file.write(text);
    return path;
}

/// An empty template; as many as there are names.
QStringList templates(const QString &names)
{
    QStringList paths;
    for (const QChar name : names)
        paths.append(
            writeFile(StatReportTest::temporaryPath(QStringLiteral("templates/%1.rtp").arg(name)), "{}"));
    return paths;
}

/// Off-screen windows cannot be raised, and say so.
void expectRaise()
{
    if (QGuiApplication::platformName() == QLatin1String("offscreen"))
        StatReportTest::expectWarning(QRegularExpression(QStringLiteral("raise")));
}

/// The template with one text block.
QString templateWithText()
{
    return writeFile(StatReportTest::temporaryPath(QStringLiteral("templates/text.rtp")),
                     R"({"nodes":[{"name":"Text Document","config":{"text":"Hello"}}]})");
}

/// Names of the module's dynamic symbols that it defines, or that it wants from others.
QStringList symbols(const QString &kind)
{
    QProcess nm;
    nm.start(QStringLiteral(STATREPORT_NM),
             {QStringLiteral("-D"), QStringLiteral("-C"), kind, QStringLiteral(STATREPORT_PLUGIN)});
    nm.waitForFinished();
    QStringList names;
    const QStringList lines = QString::fromUtf8(nm.readAllStandardOutput()).split(QLatin1Char('\n'));
    for (const QString &line : lines) {
        const QString name = line.mid(line.indexOf(QRegularExpression(QStringLiteral(" [A-Za-z] "))) + 3);
        if (!name.isEmpty())
            names.append(name);
    }
    return names;
}

/// Counts how often the application's translators changed.
class LanguageChanges : public QObject
{
public:
    explicit LanguageChanges(QObject *watched) { watched->installEventFilter(this); }
    int count() const { return m_count; }
    bool eventFilter(QObject *watched, QEvent *event) override
    {
        if (event->type() == QEvent::LanguageChange)
            ++m_count;
        return QObject::eventFilter(watched, event);
    }

private:
    int m_count = 0;
};

} // namespace

class StatReportingPluginTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();
    void init();
    void cleanup();

    void isFoundByItsMetadata();
    void hasTheEntryPoints();
    void hidesAllElse();
    void sharesTheSingletonsOfTheHost_data();
    void sharesTheSingletonsOfTheHost();
    void theInstanceIsTheSameUntilItDies();
    void casts_data();
    void casts();
    void declaresItsSlotsInOrder();
    void servesOneGroup();
    void refusesOtherGroups_data();
    void refusesOtherGroups();
    void makesOneTool();

    void buildsItsForm();
    void namesItsControls_data();
    void namesItsControls();
    void drawsItsIcons();
    void drawsItsIconsAnewInAnotherTheme();
    void fitsItsWidth_data();
    void fitsItsWidth();
    void longNamesDoNotWidenIt();
    void longNamesAreShortenedInTheMiddle();
    void followsALanguageChange();

    void loadsTheTranslation_data();
    void loadsTheTranslation();
    void anUnknownLanguageLeavesTheTranslatorsAlone();
    void theSameLanguageIsNotLoadedAgain_data();
    void theSameLanguageIsNotLoadedAgain();
    void anotherLanguageReplacesTheFirst();
    void anUnknownLanguageRemovesTheFirst();

    void restoresTheList_data();
    void restoresTheList();
    void storesTheListAtTheEnd();
    void storesAnEmptyList();
    void theToolTipFollowsTheSelection();

    void browsing_data();
    void browsing();
    void browsingStartsInAFolder_data();
    void browsingStartsInAFolder();
    void browsingMakesTheEditor();
    void browsingTellsCasesApart();
    void theListIsKeptUntilTheNextRun();

    void exportingNothingIsTold();
    void exportingWritesAReport();
    void exportingAsksNothing();
    void exportingABrokenTemplate_data();
    void exportingABrokenTemplate();

    void theEditorButtonOpensAndCloses();
    void theEditorStartsEmpty();
    void theEditorMayStayOpen();
    void givenTemplateOpensInTheEditor();
    void givenTemplateAsksAboutChanges_data();
    void givenTemplateAsksAboutChanges();
    void givenTemplateMayBeBroken();
    void uncheckingClosesAHiddenEditor();
    void theEditorTellsThatItClosed();
    void theEditorIsMadeAgain();
    void theStatisticsButtonOpensAndCloses();
    void theStatisticsWindowIsMadeAgain();

    void activationDoesNothing();
    void deactivationClosesBothWindows();
    void deactivationLeavesHiddenWindowsAlone();
    void deactivationAsksWithoutCancel_data();
    void deactivationAsksWithoutCancel();

    void diesWithBothWindowsOpen();
    void outlivesTheMainWindow();
    void diesBetweenEvents();
    void endsWithItsHost_data();
    void endsWithItsHost();

private:
    bool initialize();
    void makeWindow();
    void restart();
    ZtPluginInterface *interface() const { return qobject_cast<ZtPluginInterface *>(m_plugin); }
    KvToolBase *tool() const { return m_window->tools().value(0); }
    QWidget *panel() const { return tool()->guiWidget(); }
    QToolButton *button(const char *name) const
    {
        return panel()->findChild<QToolButton *>(QLatin1String(name));
    }
    void click(const char *name) const { button(name)->click(); }
    QComboBox *list() const { return panel()->findChild<QComboBox *>(QStringLiteral("theTemplatePath")); }
    QStringList listedPaths() const;
    QString current() const { return list()->currentData().toString(); }
    QWidget *windowOf(const char *className) const;
    QWidget *editor() const { return windowOf("KvReportTemplatesEditor"); }
    QWidget *statistics() const { return windowOf("KvStatisticsWindow"); }
    /** Shows the editor and makes its template a modified one. */
    void openModifiedEditor();

    QPluginLoader m_loader;
    QPointer<QObject> m_plugin;
    QPointer<KvGuiMainWindowBase> m_window;
};

void StatReportingPluginTest::initTestCase()
{
    m_loader.setFileName(QStringLiteral(STATREPORT_PLUGIN));
    QVERIFY2(m_loader.load(), qPrintable(m_loader.errorString()));
}

void StatReportingPluginTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    ZtAppSettings::setValue(QStringLiteral("ReportPdfPath"), temporaryPath(QString()));
    ZtStatusLog::getInstance()->clear();
    makeWindow();
}

void StatReportingPluginTest::cleanup()
{
    delete m_plugin;
    delete m_window;
    acss::QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Dark"));
    qApp->setStyleSheet(QString());
    StatReportTest::cleanup();
}

void StatReportingPluginTest::makeWindow()
{
    m_plugin = m_loader.instance();
    m_window = new KvGuiMainWindowBase;
}

void StatReportingPluginTest::restart()
{
    delete m_plugin;
    delete m_window;
    makeWindow();
}

bool StatReportingPluginTest::initialize()
{
    const bool made = interface()->initialize(toolGroup, m_window);
    m_window->setCentralWidget(tool()->panel());
    m_window->show();
    return made;
}

QStringList StatReportingPluginTest::listedPaths() const
{
    QStringList paths;
    for (int i = 0; i < list()->count(); ++i)
        paths.append(list()->itemData(i).toString());
    return paths;
}

QWidget *StatReportingPluginTest::windowOf(const char *className) const
{
    const QList<QWidget *> children =
        m_window->findChildren<QWidget *>(QString(), Qt::FindDirectChildrenOnly);
    for (QWidget *child : children) {
        if (child->inherits(className))
            return child;
    }
    return nullptr;
}

void StatReportingPluginTest::openModifiedEditor()
{
    click("theEditorButton");
    QVERIFY(QMetaObject::invokeMethod(editor(), "slotHeaderButtonClicked", Q_ARG(bool, true)));
    QVERIFY(editor()->windowTitle().contains(QLatin1Char('*')));
}

void StatReportingPluginTest::isFoundByItsMetadata()
{
    const QJsonObject metaData = m_loader.metaData();
    QCOMPARE(metaData.value(QStringLiteral("IID")).toString(), QStringLiteral("StatReportingPlugin"));
    QCOMPARE(metaData.value(QStringLiteral("className")).toString(), QStringLiteral("StatReportingPlugin"));
    QVERIFY(!metaData.contains(QStringLiteral("MetaData")));
}

void StatReportingPluginTest::hasTheEntryPoints()
{
    QLibrary library(QStringLiteral(STATREPORT_PLUGIN));
    QVERIFY(library.resolve("qt_plugin_instance"));
    QVERIFY(library.resolve("qt_plugin_query_metadata"));
}

void StatReportingPluginTest::hidesAllElse()
{
    QStringList names = symbols(QStringLiteral("--defined-only"));
    names.sort();
    QCOMPARE(names,
             QStringList({QStringLiteral("qt_plugin_instance"), QStringLiteral("qt_plugin_query_metadata")}));
}

void StatReportingPluginTest::sharesTheSingletonsOfTheHost_data()
{
    QTest::addColumn<QString>("getter");
    for (const char *name :
         {"ZtKernelData", "ZtSignalCenter", "ZtAppSettings", "ZtImageTools", "acss::QtAdvancedStylesheet"})
        QTest::newRow(name) << QLatin1String(name) + QStringLiteral("::getInstance()");
}

/// With one of its own the plug-in would neither hear the host nor see its settings.
void StatReportingPluginTest::sharesTheSingletonsOfTheHost()
{
    QFETCH(QString, getter);
    QVERIFY(symbols(QStringLiteral("--undefined-only")).contains(getter));
}

void StatReportingPluginTest::theInstanceIsTheSameUntilItDies()
{
    using Instance = QObject *(*)();
    const auto instance =
        reinterpret_cast<Instance>(QLibrary(QStringLiteral(STATREPORT_PLUGIN)).resolve("qt_plugin_instance"));
    QCOMPARE(instance(), m_plugin.data());
    QCOMPARE(instance(), m_plugin.data());
    delete m_plugin;
    const QPointer<QObject> second = instance();
    QVERIFY(second);
    QCOMPARE(instance(), second.data());
    delete second;
}

void StatReportingPluginTest::casts_data()
{
    QTest::addColumn<QByteArray>("name");
    QTest::addColumn<bool>("toPlugin");
    QTest::addColumn<bool>("toInterface");
    QTest::newRow("class") << QByteArray("StatReportingPlugin") << true << false;
    QTest::newRow("interface") << QByteArray("ZtPluginInterface") << false << true;
    QTest::newRow("identifier") << QByteArray("com.Tarvosen.plugin.ManipulatorPluginInterface/1.0") << false
                                << true;
    QTest::newRow("base") << QByteArray("QObject") << true << false;
    QTest::newRow("unknown") << QByteArray("KvUnknown") << false << false;
    QTest::newRow("other case") << QByteArray("statreportingplugin") << false << false;
}

void StatReportingPluginTest::casts()
{
    QFETCH(QByteArray, name);
    QFETCH(bool, toPlugin);
    QFETCH(bool, toInterface);
    const void *result = m_plugin->qt_metacast(name.constData());
    if (toPlugin)
        QCOMPARE(result, static_cast<const void *>(m_plugin.data()));
    else if (toInterface)
        QCOMPARE(result, static_cast<const void *>(dynamic_cast<ZtPluginInterface *>(m_plugin.data())));
    QCOMPARE(result != nullptr, toPlugin || toInterface);
}

void StatReportingPluginTest::declaresItsSlotsInOrder()
{
    const QMetaObject &metaObject = *m_plugin->metaObject();
    QCOMPARE(QLatin1String(metaObject.className()), QLatin1String("StatReportingPlugin"));
    QCOMPARE(ownMethods(metaObject, QMetaMethod::Signal), QStringList());
    QCOMPARE(
        ownMethods(metaObject, QMetaMethod::Slot),
        QStringList({QStringLiteral("slotBrowseClicked()"), QStringLiteral("slotEditorClicked()"),
                     QStringLiteral("slotExportClicked()"), QStringLiteral("slotStatisticsClicked()"),
                     QStringLiteral("slotEditorClosed()"), QStringLiteral("slotStatisticsClosed()"),
                     QStringLiteral("slotToolActivated(bool)"), QStringLiteral("slotSaveReportTemplates()"),
                     QStringLiteral("slotCurrentTemplateSelected(int)")}));
}

void StatReportingPluginTest::servesOneGroup()
{
    QVERIFY(interface());
    QCOMPARE(interface()->groupNames(), QStringList(QStringLiteral("Statistics tools")));
    QCOMPARE(interface()->order(), 75);
    const BracketTranslator translator(QStringLiteral("StatReportingPlugin"));
    QCOMPARE(interface()->groupNames(), QStringList(QStringLiteral("Statistics tools")));
}

void StatReportingPluginTest::refusesOtherGroups_data()
{
    QTest::addColumn<QString>("group");
    QTest::newRow("none") << QString();
    QTest::newRow("other") << QStringLiteral("Measuring tools");
    QTest::newRow("other case") << QStringLiteral("statistics tools");
    QTest::newRow("longer") << QStringLiteral("Statistics tools ");
    QTest::newRow("translated") << QStringLiteral("Report & Statistic");
}

void StatReportingPluginTest::refusesOtherGroups()
{
    QFETCH(QString, group);
    const LanguageChanges changes(qApp);
    QVERIFY(!interface()->initialize(group, m_window));
    QVERIFY(m_window->tools().isEmpty());
    QVERIFY(m_window->findChildren<QToolButton *>().isEmpty());
    QCOMPARE(changes.count(), 0);
}

void StatReportingPluginTest::makesOneTool()
{
    QVERIFY(initialize());
    QCOMPARE(m_window->tools().size(), 1);
    QCOMPARE(tool()->name(), QStringLiteral("statreport"));
    QCOMPARE(tool()->title(), QStringLiteral("Report & Statistic"));
    QVERIFY(tool()->isEnabled());
    QVERIFY(!tool()->isActivated());
    QVERIFY(!tool()->isResetVisible());
    QVERIFY(!tool()->getToolButton()->icon().isNull());
    QVERIFY(panel());
    QVERIFY(panel()->isVisible());
    QVERIFY(!editor());
    QVERIFY(!statistics());
    QVERIFY(ZtStatusLog::getInstance()->entries().isEmpty());
}

void StatReportingPluginTest::buildsItsForm()
{
    initialize();
    QCOMPARE(QLatin1String(panel()->metaObject()->className()), QLatin1String("QWidget"));
    QCOMPARE(panel()->objectName(), QStringLiteral("GuiStatReportingPluginUi"));
    QCOMPARE(panel()->windowTitle(), QStringLiteral("Form"));
    QCOMPARE(panel()->sizePolicy().horizontalPolicy(), QSizePolicy::Fixed);
    QCOMPARE(panel()->sizePolicy().verticalPolicy(), QSizePolicy::Preferred);
    QCOMPARE(panel()->minimumSize(), QSize(152, 0));
    QCOMPARE(panel()->maximumSize(), QSize(158, 150));

    QLayout *outer = panel()->layout();
    QCOMPARE(outer->objectName(), QStringLiteral("verticalLayout_2"));
    QCOMPARE(outer->spacing(), 0);
    QCOMPARE(outer->contentsMargins(), QMargins());
    QCOMPARE(outer->count(), 1);
    const auto *frame = qobject_cast<QFrame *>(outer->itemAt(0)->widget());
    QVERIFY(frame);
    QCOMPARE(frame->objectName(), QStringLiteral("frame"));
    QCOMPARE(frame->frameShape(), QFrame::StyledPanel);
    QCOMPARE(frame->frameShadow(), QFrame::Raised);

    QLayout *rows = frame->layout();
    QCOMPARE(rows->objectName(), QStringLiteral("verticalLayout"));
    QCOMPARE(rows->contentsMargins(), QMargins(6, 6, 6, 6));
    QCOMPARE(rows->count(), 3);

    QLayout *buttons = rows->itemAt(0)->layout();
    QCOMPARE(buttons->objectName(), QStringLiteral("horizontalLayout_2"));
    QCOMPARE(buttons->spacing(), 4);
    QCOMPARE(buttons->count(), 4);
    QCOMPARE(buttons->itemAt(0)->widget()->objectName(), QStringLiteral("theEditorButton"));
    QCOMPARE(buttons->itemAt(1)->widget()->objectName(), QStringLiteral("theExportButton"));
    const QSpacerItem *spacer = buttons->itemAt(2)->spacerItem();
    QVERIFY(spacer);
    QCOMPARE(spacer->sizeHint(), QSize(0, 20));
    QCOMPARE(spacer->sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::Minimum));
    QCOMPARE(buttons->itemAt(3)->widget()->objectName(), QStringLiteral("theStatisticsButton"));

    const auto *line = qobject_cast<QFrame *>(rows->itemAt(1)->widget());
    QVERIFY(line);
    QCOMPARE(line->objectName(), QStringLiteral("measureline_3"));
    QCOMPARE(line->frameShape(), QFrame::HLine);
    QCOMPARE(line->frameShadow(), QFrame::Sunken);

    QLayout *templatesPart = rows->itemAt(2)->layout();
    QCOMPARE(templatesPart->objectName(), QStringLiteral("verticalLayout_3"));
    QCOMPARE(templatesPart->spacing(), 4);
    QCOMPARE(templatesPart->count(), 2);
    QLayout *browse = templatesPart->itemAt(0)->layout();
    QCOMPARE(browse->objectName(), QStringLiteral("horizontalLayout"));
    QCOMPARE(browse->count(), 3);
    const auto *label = qobject_cast<QLabel *>(browse->itemAt(0)->widget());
    QVERIFY(label);
    QCOMPARE(label->objectName(), QStringLiteral("label"));
    QCOMPARE(label->sizePolicy().horizontalPolicy(), QSizePolicy::Maximum);
    QCOMPARE(label->sizePolicy().verticalPolicy(), QSizePolicy::Maximum);
    QCOMPARE(int(label->alignment()), int(Qt::AlignLeft | Qt::AlignVCenter));
    const QSpacerItem *browseSpacer = browse->itemAt(1)->spacerItem();
    QVERIFY(browseSpacer);
    QCOMPARE(browseSpacer->sizeHint(), QSize(40, 20));
    QCOMPARE(browseSpacer->sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::Minimum));
    QCOMPARE(browse->itemAt(2)->widget()->objectName(), QStringLiteral("theBrowseButton"));
    QCOMPARE(templatesPart->itemAt(1)->widget(), list());

    for (const char *name : buttonNames) {
        QVERIFY(button(name)->autoRaise());
        QVERIFY(button(name)->text().isEmpty());
        QVERIFY(!button(name)->isChecked());
    }
    QVERIFY(button("theEditorButton")->isCheckable());
    QVERIFY(!button("theExportButton")->isCheckable());
    QVERIFY(button("theStatisticsButton")->isCheckable());
    QVERIFY(!button("theBrowseButton")->isCheckable());
}

void StatReportingPluginTest::namesItsControls_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("toolTip");
    QTest::addColumn<QString>("statusTip");
    QTest::newRow("editor") << QStringLiteral("theEditorButton") << QStringLiteral("Open Templates Editor")
                            << QStringLiteral("Opens Report Template Editor");
    // The spelling has always been this.
    QTest::newRow("export") << QStringLiteral("theExportButton") << QStringLiteral("Generate Report File")
                            << QStringLiteral("Exports current measurments to pdf file.");
    QTest::newRow("statistics") << QStringLiteral("theStatisticsButton")
                                << QStringLiteral("Open Statistics Window") << QString();
    QTest::newRow("browse") << QStringLiteral("theBrowseButton") << QStringLiteral("Browse Templates")
                            << QStringLiteral("Opens default template for report generation");
}

void StatReportingPluginTest::namesItsControls()
{
    QFETCH(QString, name);
    initialize();
    const auto *control = panel()->findChild<QToolButton *>(name);
    QVERIFY(control);
    QTEST(control->toolTip(), "toolTip");
    QTEST(control->accessibleName(), "toolTip");
    QTEST(control->statusTip(), "statusTip");
    QCOMPARE(panel()->findChild<QLabel *>(QStringLiteral("label"))->text(), QStringLiteral("Template:"));
}

void StatReportingPluginTest::drawsItsIcons()
{
    initialize();
    for (int i = 0; i < 4; ++i) {
        const QToolButton *control = button(buttonNames[i]);
        QCOMPARE(control->iconSize(), iconSize);
        QCOMPARE(control->minimumSize(), iconSize);
        QCOMPARE(control->maximumSize(), iconSize);
        const QImage image = iconImage(control->icon());
        QVERIFY(!image.isNull());
        QCOMPARE(image, expectedIcon(iconPaths[i]));
        for (int k = 0; k < i; ++k)
            QVERIFY(image != iconImage(button(buttonNames[k])->icon()));
    }
    QCOMPARE(iconImage(tool()->getToolButton()->icon()), expectedIcon("Icons/statreport"));
}

void StatReportingPluginTest::drawsItsIconsAnewInAnotherTheme()
{
    initialize();
    QMap<QToolButton *, qint64> before;
    before.insert(tool()->getToolButton(), 0);
    for (const char *name : buttonNames)
        before.insert(button(name), 0);
    for (auto it = before.begin(); it != before.end(); ++it)
        it.value() = it.key()->icon().cacheKey();
    const QImage dark = iconImage(button("theBrowseButton")->icon());
    acss::QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Light"));
    for (auto it = before.cbegin(); it != before.cend(); ++it)
        QVERIFY(it.key()->icon().cacheKey() != it.value());
    for (int i = 0; i < 4; ++i)
        QCOMPARE(iconImage(button(buttonNames[i])->icon()), expectedIcon(iconPaths[i]));
    QVERIFY(iconImage(button("theBrowseButton")->icon()) != dark);
}

void StatReportingPluginTest::fitsItsWidth_data()
{
    QTest::addColumn<QString>("theme");
    QTest::newRow("no style sheet") << QString();
    QTest::newRow("dark") << QStringLiteral("Dark");
    QTest::newRow("light") << QStringLiteral("Light");
}

void StatReportingPluginTest::fitsItsWidth()
{
    QFETCH(QString, theme);
    auto *style = acss::QtAdvancedStylesheet::getInstance();
    if (style->setCurrentTheme(theme))
        style->applyTo(qApp);
    store(QStringLiteral("ReportTemplatePaths"), templates(QStringLiteral("abc")));
    initialize();
    panel()->ensurePolished();
    panel()->layout()->activate();
    QVERIFY2(panel()->minimumSizeHint().width() <= 152,
             qPrintable(QString::number(panel()->minimumSizeHint().width())));
    QVERIFY2(panel()->minimumSizeHint().height() <= 150,
             qPrintable(QString::number(panel()->minimumSizeHint().height())));
    const QList<QWidget *> all = panel()->findChildren<QWidget *>();
    for (const QWidget *widget : all) {
        if (!widget->isVisible() || widget->parentWidget() == list())
            continue;
        const QRect inside(widget->mapTo(panel(), QPoint(0, 0)), widget->size());
        QVERIFY2(panel()->rect().contains(inside), qPrintable(widget->objectName()));
    }
    const auto *label = panel()->findChild<QLabel *>(QStringLiteral("label"));
    QVERIFY(label->width() >= label->sizeHint().width());
    QVERIFY(label->height() >= label->sizeHint().height());
}

void StatReportingPluginTest::longNamesDoNotWidenIt()
{
    const QString name = QString(100, QLatin1Char('w')) + QStringLiteral(".rtp");
    const QString path = writeFile(temporaryPath(QStringLiteral("templates/") + name), "{}");
    initialize();
    const int before = panel()->minimumSizeHint().width();
    list()->insertItem(0, name, path);
    QCOMPARE(panel()->minimumSizeHint().width(), before);
}

/// The ends of long names, which tell templates apart, can be read.
void StatReportingPluginTest::longNamesAreShortenedInTheMiddle()
{
    acss::QtAdvancedStylesheet::getInstance()->applyTo(qApp);
    initialize();
    const QString start(100, QLatin1Char('w'));
    list()->addItems(
        {start + QStringLiteral("a.rtp"), start + QStringLiteral("b.rtp"), start + QStringLiteral("a.rtp")});
    QVector<QImage> images;
    for (int i = 0; i < list()->count(); ++i) {
        list()->setCurrentIndex(i);
        images.append(list()->grab().toImage());
    }
    QVERIFY(images.at(0) != images.at(1));
    QCOMPARE(images.at(0), images.at(2));
}

void StatReportingPluginTest::followsALanguageChange()
{
    initialize();
    {
        const BracketTranslator translator(QStringLiteral("GuiStatReportingPluginUi"));
        QTRY_COMPARE(button("theEditorButton")->toolTip(), QStringLiteral("[Open Templates Editor]"));
        QCOMPARE(panel()->findChild<QLabel *>(QStringLiteral("label"))->text(),
                 QStringLiteral("[Template:]"));
    }
    QTRY_COMPARE(button("theEditorButton")->toolTip(), QStringLiteral("Open Templates Editor"));
}

void StatReportingPluginTest::loadsTheTranslation_data()
{
    QTest::addColumn<QString>("language");
    QTest::addColumn<QString>("title");
    const QString english = QStringLiteral("Report & Statistic");
    const QString untranslated = QStringLiteral("Statistics tools");
    QTest::newRow("nothing stored") << QString() << english; // the tests run in an English locale
    QTest::newRow("the system's") << QStringLiteral("auto") << english;
    QTest::newRow("English") << QStringLiteral("English") << english;
    QTest::newRow("unknown") << QStringLiteral("Klingon") << untranslated;
    // File names of resources tell cases apart.
    QTest::newRow("in another case") << QStringLiteral("english") << untranslated;
}

void StatReportingPluginTest::loadsTheTranslation()
{
    QFETCH(QString, language);
    if (!language.isEmpty())
        ZtAppSettings::setValue(QStringLiteral("GEN_Language"), language);
    initialize();
    QTEST(tool()->title(), "title");
    delete m_plugin;
    // With the plug-in goes its translation.
    QCOMPARE(QCoreApplication::translate("StatReportingPlugin", "Statistics tools"),
             QStringLiteral("Statistics tools"));
}

void StatReportingPluginTest::anUnknownLanguageLeavesTheTranslatorsAlone()
{
    const BracketTranslator other(QStringLiteral("StatReportingPlugin"));
    ZtAppSettings::setValue(QStringLiteral("GEN_Language"), QStringLiteral("Klingon"));
    const LanguageChanges changes(qApp);
    initialize();
    QCOMPARE(changes.count(), 0);
    QCOMPARE(tool()->title(), QStringLiteral("[Statistics tools]"));
}

void StatReportingPluginTest::theSameLanguageIsNotLoadedAgain_data()
{
    QTest::addColumn<QString>("first");
    QTest::addColumn<QString>("second");
    const QString english = QStringLiteral("English");
    const QString german = QStringLiteral("German");
    QTest::newRow("English") << english << english;
    QTest::newRow("English, lower case") << english << QStringLiteral("english");
    QTest::newRow("English, upper case") << english << QStringLiteral("ENGLISH");
    QTest::newRow("English, the system's") << english << QStringLiteral("auto");
    QTest::newRow("German") << german << german;
    QTest::newRow("German, lower case") << german << QStringLiteral("german");
    QTest::newRow("German, mixed case") << german << QStringLiteral("gErMaN");
}

void StatReportingPluginTest::theSameLanguageIsNotLoadedAgain()
{
    QFETCH(QString, first);
    QFETCH(QString, second);
    ZtAppSettings::setValue(QStringLiteral("GEN_Language"), first);
    initialize();
    ZtAppSettings::setValue(QStringLiteral("GEN_Language"), second);
    const QString title = tool()->title();
    const LanguageChanges changes(qApp);
    QVERIFY(interface()->initialize(toolGroup, m_window));
    QCOMPARE(changes.count(), 0);
    QCOMPARE(m_window->tools().last()->title(), title);
}

void StatReportingPluginTest::anotherLanguageReplacesTheFirst()
{
    ZtAppSettings::setValue(QStringLiteral("GEN_Language"), QStringLiteral("German"));
    initialize();
    ZtAppSettings::setValue(QStringLiteral("GEN_Language"), QStringLiteral("English"));
    interface()->initialize(toolGroup, m_window);
    QCOMPARE(m_window->tools().last()->title(), QStringLiteral("Report & Statistic"));
}

void StatReportingPluginTest::anUnknownLanguageRemovesTheFirst()
{
    ZtAppSettings::setValue(QStringLiteral("GEN_Language"), QStringLiteral("English"));
    initialize();
    ZtAppSettings::setValue(QStringLiteral("GEN_Language"), QStringLiteral("Klingon"));
    interface()->initialize(toolGroup, m_window);
    QCOMPARE(m_window->tools().last()->title(), QStringLiteral("Statistics tools"));
    // The first one still counts as current, so it does not come back.
    ZtAppSettings::setValue(QStringLiteral("GEN_Language"), QStringLiteral("English"));
    interface()->initialize(toolGroup, m_window);
    QCOMPARE(m_window->tools().last()->title(), QStringLiteral("Statistics tools"));
}

void StatReportingPluginTest::restoresTheList_data()
{
    QTest::addColumn<QString>("stored");
    QTest::addColumn<QString>("storedCurrent");
    QTest::addColumn<QString>("missing");
    QTest::addColumn<QString>("listed");
    const QString none;
    QTest::newRow("nothing") << none << none << none << none;
    QTest::newRow("in order") << QStringLiteral("cab") << QStringLiteral("c") << none
                              << QStringLiteral("cab");
    // The first is current, the stored one is not asked.
    QTest::newRow("another current") << QStringLiteral("ab") << QStringLiteral("b") << none
                                     << QStringLiteral("ab");
    QTest::newRow("no current") << QStringLiteral("ab") << none << none << QStringLiteral("ab");
    QTest::newRow("one is missing") << QStringLiteral("abc") << QStringLiteral("a") << QStringLiteral("a")
                                    << QStringLiteral("bc");
    QTest::newRow("all are missing") << QStringLiteral("ab") << QStringLiteral("a") << QStringLiteral("ab")
                                     << none;
    // There is nothing that could be selected.
    QTest::newRow("a current one without a list") << none << QStringLiteral("a") << none << none;
    QTest::newRow("more than five") << QStringLiteral("abcdefg") << none << none << QStringLiteral("abcdefg");
    QTest::newRow("one twice") << QStringLiteral("aba") << none << none << QStringLiteral("aba");
}

void StatReportingPluginTest::restoresTheList()
{
    QFETCH(QString, stored);
    QFETCH(QString, storedCurrent);
    QFETCH(QString, missing);
    QFETCH(QString, listed);
    store(QStringLiteral("ReportTemplatePaths"), templates(stored));
    store(QStringLiteral("CurrentReportTemplate"), templates(storedCurrent).value(0));
    for (const QString &path : templates(missing))
        QFile::remove(path);
    initialize();
    QCOMPARE(list()->count(), listed.size());
    for (int i = 0; i < listed.size(); ++i)
        QCOMPARE(list()->itemText(i), QString(listed.at(i)) + QStringLiteral(".rtp"));
    const QStringList paths = templates(listed);
    QCOMPARE(listedPaths(), paths);
    QCOMPARE(list()->currentIndex(), listed.isEmpty() ? -1 : 0);
    QCOMPARE(list()->toolTip(), paths.value(0));
    QVERIFY(ZtStatusLog::getInstance()->entries().isEmpty());
}

void StatReportingPluginTest::storesTheListAtTheEnd()
{
    const QStringList paths = templates(QStringLiteral("abc"));
    store(QStringLiteral("ReportTemplatePaths"), paths);
    initialize();
    list()->setCurrentIndex(1);
    list()->removeItem(2);
    QCOMPARE(stored(QStringLiteral("ReportTemplatePaths")).toStringList(), paths);
    emit ZtSignalCenter::getInstance()->signalAppAboutToClose();
    QCOMPARE(stored(QStringLiteral("ReportTemplatePaths")).toStringList(), paths.mid(0, 2));
    QCOMPARE(stored(QStringLiteral("CurrentReportTemplate")).toString(), paths.at(1));
}

void StatReportingPluginTest::storesAnEmptyList()
{
    store(QStringLiteral("ReportTemplatePaths"), QStringList(QStringLiteral("/nowhere/a.rtp")));
    store(QStringLiteral("CurrentReportTemplate"), QStringLiteral("/nowhere/a.rtp"));
    initialize();
    emit ZtSignalCenter::getInstance()->signalAppAboutToClose();
    QCOMPARE(stored(QStringLiteral("ReportTemplatePaths")).toStringList(), QStringList());
    QCOMPARE(stored(QStringLiteral("CurrentReportTemplate")), QVariant(QString()));
}

void StatReportingPluginTest::theToolTipFollowsTheSelection()
{
    const QStringList paths = templates(QStringLiteral("abc"));
    store(QStringLiteral("ReportTemplatePaths"), paths);
    initialize();
    for (const int i : {2, 0, 1}) {
        list()->setCurrentIndex(i);
        QCOMPARE(list()->toolTip(), paths.at(i));
        list()->setToolTip(QString());
        QVERIFY(QMetaObject::invokeMethod(m_plugin, "slotCurrentTemplateSelected", Q_ARG(int, i)));
        QCOMPARE(list()->toolTip(), paths.at(i));
    }
    list()->clear();
    QCOMPARE(list()->toolTip(), QString());
}

void StatReportingPluginTest::browsing_data()
{
    QTest::addColumn<QString>("before");
    QTest::addColumn<int>("current");
    QTest::addColumn<QString>("chosen");
    QTest::addColumn<QString>("after");
    QTest::addColumn<int>("currentAfter");
    const auto row = [](const char *name, const char *before, int current, const char *chosen,
                        const char *after, int currentAfter = 0) {
        QTest::newRow(name) << QString::fromLatin1(before) << current << QString::fromLatin1(chosen)
                            << QString::fromLatin1(after) << currentAfter;
    };
    row("the first", "", -1, "a", "a");
    row("another", "a", 0, "b", "ba");
    row("a fifth", "abcd", 0, "e", "eabcd");
    row("a sixth drops the last", "abcde", 0, "f", "fabcd");
    row("a known one moves to the top", "abcde", 0, "d", "dabce");
    row("a known one while another is current", "abcde", 2, "e", "eabcd");
    row("the first while another is current", "abc", 2, "a", "abc");
    row("the selected one", "abc", 1, "b", "abc", 1);
    row("cancelled", "abc", 1, "", "abc", 1);
    row("a long list loses one", "abcdefg", 0, "h", "habcdef");
    row("a known one of a long list", "abcdefg", 0, "g", "gabcde");
}

void StatReportingPluginTest::browsing()
{
    QFETCH(QString, before);
    QFETCH(int, current);
    QFETCH(QString, chosen);
    QFETCH(QString, after);
    QFETCH(int, currentAfter);
    store(QStringLiteral("ReportTemplatePaths"), templates(before));
    initialize();
    list()->setCurrentIndex(current);
    const FileDialogAnswerer answerer(templates(chosen));
    click("theBrowseButton");
    QCOMPARE(answerer.dialogs().size(), 1);
    QCOMPARE(answerer.dialogs().at(0).caption, QStringLiteral("Select Report Template File"));
    QCOMPARE(answerer.dialogs().at(0).filters, QStringList(QStringLiteral("Report Template File (*.rtp)")));
    QVERIFY(!answerer.dialogs().at(0).isNative);
    QVERIFY(!answerer.dialogs().at(0).hasParent);
    const QStringList paths = templates(after);
    QCOMPARE(listedPaths(), paths);
    QCOMPARE(list()->currentIndex(), currentAfter);
    QCOMPARE(list()->currentText(), QFileInfo(paths.value(currentAfter)).fileName());
    QCOMPARE(list()->toolTip(), paths.value(currentAfter));
}

void StatReportingPluginTest::browsingStartsInAFolder_data()
{
    QTest::addColumn<bool>("hasTemplate");
    QTest::addColumn<bool>("isThere");
    QTest::addColumn<QString>("folder");
    QTest::newRow("of the selected template") << true << true << QStringLiteral("templates");
    QTest::newRow("of templates, as there is none") << false << false << QStringLiteral("other");
    QTest::newRow("of templates, as it is gone") << true << false << QStringLiteral("other");
}

void StatReportingPluginTest::browsingStartsInAFolder()
{
    QFETCH(bool, hasTemplate);
    QFETCH(bool, isThere);
    QFETCH(QString, folder);
    QDir().mkpath(temporaryPath(QStringLiteral("other")));
    ZtAppSettings::setValue(QStringLiteral("ReportTemplatesPath"), temporaryPath(QStringLiteral("other")));
    const QStringList paths = templates(QStringLiteral("a"));
    if (hasTemplate)
        store(QStringLiteral("ReportTemplatePaths"), paths);
    initialize();
    if (!isThere)
        QFile::remove(paths.at(0));
    const FileDialogAnswerer answerer;
    click("theBrowseButton");
    QCOMPARE(answerer.dialogs().value(0).directory, QFileInfo(temporaryPath(folder)).absoluteFilePath());
}

void StatReportingPluginTest::browsingMakesTheEditor()
{
    initialize();
    const FileDialogAnswerer answerer;
    click("theBrowseButton");
    const QPointer<QWidget> made = editor();
    QVERIFY(made);
    QVERIFY(!made->isVisible());
    QVERIFY(!button("theEditorButton")->isChecked());
    click("theBrowseButton");
    QCOMPARE(editor(), made.data());
}

/// Paths are the same only letter by letter; the list may hold what looks alike.
void StatReportingPluginTest::browsingTellsCasesApart()
{
    const QStringList paths = templates(QStringLiteral("aA"));
    store(QStringLiteral("ReportTemplatePaths"), paths);
    initialize();
    const QString third = writeFile(temporaryPath(QStringLiteral("templates/inner/a.rtp")), "{}");
    const FileDialogAnswerer answerer({third, paths.at(1)});
    click("theBrowseButton");
    QCOMPARE(listedPaths(), QStringList({third, paths.at(0), paths.at(1)}));
    QCOMPARE(list()->itemText(0), list()->itemText(1));
    click("theBrowseButton");
    QCOMPARE(listedPaths(), QStringList({paths.at(1), third, paths.at(0)}));
}

void StatReportingPluginTest::theListIsKeptUntilTheNextRun()
{
    const QString settings = temporaryPath(QStringLiteral("kept.ini"));
    const QStringList names{QStringLiteral("one, two"), QStringLiteral("a '%41' & c;d=e"),
                            QString::fromUtf8("Größe μm ☃")};
    for (int count = 0; count <= names.size(); ++count) {
        QFile::remove(settings);
        ZtAppSettings::getInstance()->setStoragePath(settings);
        restart();
        initialize();
        QStringList paths;
        for (int i = 0; i < count; ++i)
            paths.append(writeFile(temporaryPath(names.at(i) + QStringLiteral(".rtp")), "{}"));
        const FileDialogAnswerer answerer(paths);
        for (int i = 0; i < count; ++i)
            click("theBrowseButton");
        emit ZtSignalCenter::getInstance()->signalAppAboutToClose();
        const QStringList before = listedPaths();
        QCOMPARE(before.size(), count);
        ZtAppSettings::getInstance()->setStoragePath(settings); // writes and reads it again
        restart();
        initialize();
        QCOMPARE(listedPaths(), before);
        QCOMPARE(current(), before.value(0));
    }
}

void StatReportingPluginTest::exportingNothingIsTold()
{
    initialize();
    click("theExportButton");
    const QVector<ZtStatusEntry> entries = ZtStatusLog::getInstance()->entries();
    QCOMPARE(entries.size(), 1);
    QCOMPARE(entries.at(0).category, 2);
    QCOMPARE(entries.at(0).code, 0);
    QCOMPARE(entries.at(0).destination, 4);
    QCOMPARE(entries.at(0).message, QStringLiteral("No report template selected."));
    QCOMPARE(entries.at(0).source, QStringLiteral("StatReportingPlugin::slotExportClicked"));
    QVERIFY(!editor());
}

void StatReportingPluginTest::exportingWritesAReport()
{
    store(QStringLiteral("ReportTemplatePaths"), QStringList(templateWithText()));
    initialize();
    const QString pdf = temporaryPath(QStringLiteral("report.pdf"));
    QFile::remove(pdf);
    const FileDialogAnswerer answerer(pdf);
    click("theExportButton");
    QCOMPARE(answerer.dialogs().size(), 1);
    QFile file(pdf);
    QVERIFY(file.open(QIODevice::ReadOnly));
    QVERIFY(file.read(5) == "%PDF-");
    QVERIFY(editor());
    QVERIFY(!editor()->isVisible());
    QVERIFY(editor()->windowTitle().endsWith(QStringLiteral("text.rtp")));
    QVERIFY(ZtStatusLog::getInstance()->entries().isEmpty());
}

/// Whatever the editor holds is replaced without a question.
void StatReportingPluginTest::exportingAsksNothing()
{
    store(QStringLiteral("ReportTemplatePaths"), QStringList(templateWithText()));
    initialize();
    openModifiedEditor();
    const FileDialogAnswerer files;
    const MessageBoxAnswerer boxes;
    click("theExportButton");
    QCOMPARE(files.dialogs().size(), 1);
    QVERIFY(boxes.boxes().isEmpty());
    QVERIFY(editor()->windowTitle().endsWith(QStringLiteral("text.rtp")));
    QVERIFY(!editor()->windowTitle().contains(QLatin1Char('*')));
}

void StatReportingPluginTest::exportingABrokenTemplate_data()
{
    QTest::addColumn<QByteArray>("text");
    QTest::addColumn<int>("boxes");
    QTest::newRow("no JSON") << QByteArray("{") << 1;
    QTest::newRow("no object") << QByteArray("[]") << 0;
    QTest::newRow("a refused block") << QByteArray(R"({"nodes":[{"name":"Text Document"}]})") << 0;
}

void StatReportingPluginTest::exportingABrokenTemplate()
{
    QFETCH(QByteArray, text);
    const QString path = writeFile(temporaryPath(QStringLiteral("templates/broken.rtp")), text);
    store(QStringLiteral("ReportTemplatePaths"), QStringList(path));
    initialize();
    const FileDialogAnswerer files;
    const MessageBoxAnswerer boxes;
    click("theExportButton");
    QTEST(boxes.boxes().size(), "boxes");
    QVERIFY(files.dialogs().isEmpty());
    QVERIFY(ZtStatusLog::getInstance()->entries().isEmpty());
    QCOMPARE(listedPaths(), QStringList(path));
}

void StatReportingPluginTest::theEditorButtonOpensAndCloses()
{
    initialize();
    click("theEditorButton");
    const QPointer<QWidget> made = editor();
    QVERIFY(made);
    QVERIFY(made->isVisible());
    QVERIFY(made->isWindow());
    QVERIFY(button("theEditorButton")->isChecked());
    click("theEditorButton");
    QVERIFY(!made->isVisible());
    QVERIFY(!button("theEditorButton")->isChecked());
    click("theEditorButton");
    QVERIFY(made->isVisible());
    QCOMPARE(editor(), made.data());
}

void StatReportingPluginTest::theEditorStartsEmpty()
{
    store(QStringLiteral("ReportTemplatePaths"), QStringList(templateWithText()));
    initialize();
    const FileDialogAnswerer answerer;
    click("theExportButton");
    QVERIFY(editor()->windowTitle().endsWith(QStringLiteral("text.rtp")));
    click("theEditorButton");
    QVERIFY2(editor()->windowTitle().endsWith(QStringLiteral(" - [new]")),
             qPrintable(editor()->windowTitle()));
}

void StatReportingPluginTest::theEditorMayStayOpen()
{
    initialize();
    openModifiedEditor();
    QSignalSpy toggled(button("theEditorButton"), SIGNAL(toggled(bool)));
    const MessageBoxAnswerer boxes(QMessageBox::Cancel);
    click("theEditorButton");
    QCOMPARE(boxes.boxes().size(), 1);
    QCOMPARE(int(boxes.boxes().at(0).buttons), int(QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel));
    QVERIFY(editor()->isVisible());
    QVERIFY(button("theEditorButton")->isChecked());
    QCOMPARE(toggled.count(), 1); // by the click; it was set again in silence
}

void StatReportingPluginTest::givenTemplateOpensInTheEditor()
{
    const QStringList known = templates(QStringLiteral("ab"));
    store(QStringLiteral("ReportTemplatePaths"), known);
    initialize();
    KvToolBase *const tool = m_window->tools().constFirst();
    QVERIFY(!tool->isActivated());
    QVERIFY(tool->opensFile(QStringLiteral("x.rtp")));
    QVERIFY(!tool->opensFile(QStringLiteral("x.json")));
    expectRaise();
    tool->openFile(templateWithText());
    QVERIFY(tool->isActivated());
    QVERIFY(editor()->isVisible());
    QVERIFY(editor()->windowTitle().endsWith(QStringLiteral("text.rtp")));
    QVERIFY(button("theEditorButton")->isChecked());
    QCOMPARE(list()->count(), 3);
    QCOMPARE(list()->currentData().toString(), templateWithText());
    expectRaise();
    tool->openFile(known.at(1));
    QCOMPARE(list()->count(), 3);
    QCOMPARE(list()->currentData().toString(), known.at(1));
}

void StatReportingPluginTest::givenTemplateAsksAboutChanges_data()
{
    QTest::addColumn<int>("answer");
    QTest::newRow("lose them") << int(QMessageBox::No);
    QTest::newRow("stay") << int(QMessageBox::Cancel);
}

void StatReportingPluginTest::givenTemplateAsksAboutChanges()
{
    QFETCH(int, answer);
    initialize();
    openModifiedEditor();
    const MessageBoxAnswerer boxes(static_cast<QMessageBox::StandardButton>(answer));
    expectRaise();
    m_window->tools().constFirst()->openFile(templateWithText());
    QCOMPARE(boxes.boxes().size(), 1);
    QCOMPARE(int(boxes.boxes().at(0).buttons), int(QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel));
    const bool isOpened = answer == QMessageBox::No;
    QCOMPARE(editor()->windowTitle().endsWith(QStringLiteral("text.rtp")), isOpened);
    QCOMPARE(list()->count(), isOpened ? 1 : 0);
    QVERIFY(editor()->isVisible());
}

void StatReportingPluginTest::givenTemplateMayBeBroken()
{
    initialize();
    const MessageBoxAnswerer boxes(QMessageBox::Ok);
    const QString path = writeFile(temporaryPath(QStringLiteral("templates/broken.rtp")), "{\"nodes\":");
    expectRaise();
    m_window->tools().constFirst()->openFile(path);
    QCOMPARE(boxes.boxes().size(), 1);
    QCOMPARE(list()->count(), 0);
    QVERIFY(editor()->isVisible());
}

void StatReportingPluginTest::uncheckingClosesAHiddenEditor()
{
    initialize();
    const FileDialogAnswerer answerer;
    click("theBrowseButton");
    QSignalSpy closed(editor(), SIGNAL(editorClosed()));
    QVERIFY(QMetaObject::invokeMethod(m_plugin, "slotEditorClicked"));
    QCOMPARE(closed.count(), 1);
    QVERIFY(!button("theEditorButton")->isChecked());
}

void StatReportingPluginTest::theEditorTellsThatItClosed()
{
    initialize();
    click("theEditorButton");
    editor()->close();
    QVERIFY(!button("theEditorButton")->isChecked());
    QVERIFY(editor());
}

void StatReportingPluginTest::theEditorIsMadeAgain()
{
    initialize();
    click("theEditorButton");
    delete editor();
    click("theEditorButton"); // unchecks
    QVERIFY(!editor());
    click("theEditorButton");
    QVERIFY(editor());
    QVERIFY(editor()->isVisible());
}

void StatReportingPluginTest::theStatisticsButtonOpensAndCloses()
{
    initialize();
    click("theStatisticsButton");
    const QPointer<QWidget> made = statistics();
    QVERIFY(made);
    QVERIFY(made->isVisible());
    QVERIFY(made->isWindow());
    QCOMPARE(made->windowTitle(), QStringLiteral("Measurement statistics"));
    click("theStatisticsButton");
    QVERIFY(!made->isVisible());
    click("theStatisticsButton");
    QVERIFY(made->isVisible());
    QCOMPARE(statistics(), made.data());
    made->close();
    QVERIFY(!button("theStatisticsButton")->isChecked());
    QVERIFY(made);
}

void StatReportingPluginTest::theStatisticsWindowIsMadeAgain()
{
    initialize();
    click("theStatisticsButton");
    delete statistics();
    click("theStatisticsButton");
    QVERIFY(!statistics());
    click("theStatisticsButton");
    QVERIFY(statistics());
    QVERIFY(statistics()->isVisible());
}

void StatReportingPluginTest::activationDoesNothing()
{
    initialize();
    click("theEditorButton");
    click("theStatisticsButton");
    tool()->getToolButton()->setChecked(true);
    QVERIFY(tool()->isActivated());
    QVERIFY(editor()->isVisible());
    QVERIFY(statistics()->isVisible());
}

void StatReportingPluginTest::deactivationClosesBothWindows()
{
    initialize();
    tool()->getToolButton()->setChecked(true);
    click("theEditorButton");
    click("theStatisticsButton");
    tool()->getToolButton()->setChecked(false);
    QVERIFY(!editor()->isVisible());
    QVERIFY(!statistics()->isVisible());
    QVERIFY(!button("theEditorButton")->isChecked());
    QVERIFY(!button("theStatisticsButton")->isChecked());
}

void StatReportingPluginTest::deactivationLeavesHiddenWindowsAlone()
{
    initialize();
    tool()->getToolButton()->setChecked(true);
    click("theEditorButton");
    click("theStatisticsButton");
    editor()->hide();
    statistics()->hide();
    QSignalSpy editorClosed(editor(), SIGNAL(editorClosed()));
    QSignalSpy statisticsClosed(statistics(), SIGNAL(windowClosed()));
    tool()->getToolButton()->setChecked(false);
    QCOMPARE(editorClosed.count(), 0);
    QCOMPARE(statisticsClosed.count(), 0);
}

void StatReportingPluginTest::deactivationAsksWithoutCancel_data()
{
    QTest::addColumn<int>("answer");
    QTest::addColumn<QString>("savedAs"); // empty: the file dialog is cancelled
    QTest::addColumn<bool>("staysOpen");
    QTest::newRow("not saved") << int(QMessageBox::No) << QString() << false;
    QTest::newRow("saved") << int(QMessageBox::Yes) << QStringLiteral("saved.rtp") << false;
    QTest::newRow("saving is cancelled") << int(QMessageBox::Yes) << QString() << true;
}

void StatReportingPluginTest::deactivationAsksWithoutCancel()
{
    QFETCH(int, answer);
    QFETCH(QString, savedAs);
    QFETCH(bool, staysOpen);
    initialize();
    tool()->getToolButton()->setChecked(true);
    openModifiedEditor();
    click("theStatisticsButton");
    const QString path = savedAs.isEmpty() ? QString() : temporaryPath(savedAs);
    {
        const MessageBoxAnswerer boxes(static_cast<QMessageBox::StandardButton>(answer));
        const FileDialogAnswerer files(path.isEmpty() ? QStringList() : QStringList(path));
        tool()->getToolButton()->setChecked(false);
        QCOMPARE(boxes.boxes().size(), 1);
        QCOMPARE(int(boxes.boxes().at(0).buttons), int(QMessageBox::Yes | QMessageBox::No));
        QCOMPARE(files.dialogs().size(), answer == QMessageBox::Yes ? 1 : 0);
    }
    QVERIFY(!statistics()->isVisible());
    QVERIFY(!button("theStatisticsButton")->isChecked());
    QCOMPARE(editor()->isVisible(), staysOpen);
    QCOMPARE(button("theEditorButton")->isChecked(), staysOpen);
    QCOMPARE(QFileInfo::exists(path), !path.isEmpty());
    // The next question has its Cancel again.
    if (!staysOpen)
        openModifiedEditor();
    const MessageBoxAnswerer boxes(QMessageBox::Cancel);
    editor()->close();
    QCOMPARE(int(boxes.boxes().value(0).buttons),
             int(QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel));
}

/// The data goes first, and the windows end their live updates after that.
void StatReportingPluginTest::diesWithBothWindowsOpen()
{
    initialize();
    click("theEditorButton");
    click("theStatisticsButton");
    const QPointer<QWidget> first = editor();
    const QPointer<QWidget> second = statistics();
    delete m_plugin;
    QVERIFY(!first);
    QVERIFY(!second);
    QVERIFY(m_window);
    // Nothing of it is left that could be called.
    acss::QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Light"));
    emit ZtSignalCenter::getInstance()->signalAppAboutToClose();
    click("theStatisticsButton");
    QVERIFY(!statistics());
    makeWindow();
}

void StatReportingPluginTest::outlivesTheMainWindow()
{
    store(QStringLiteral("ReportTemplatePaths"), templates(QStringLiteral("ab")));
    initialize();
    click("theEditorButton");
    click("theStatisticsButton");
    delete m_window;
    store(QStringLiteral("ReportTemplatePaths"), QStringList(QStringLiteral("kept")));
    acss::QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Light"));
    emit ZtSignalCenter::getInstance()->signalAppAboutToClose();
    QCOMPARE(stored(QStringLiteral("ReportTemplatePaths")).toStringList(),
             QStringList(QStringLiteral("kept")));
    for (const char *slot : {"slotBrowseClicked", "slotEditorClicked", "slotExportClicked",
                             "slotStatisticsClicked", "slotEditorClosed", "slotStatisticsClosed"})
        QVERIFY(QMetaObject::invokeMethod(m_plugin, slot));
    QVERIFY(QMetaObject::invokeMethod(m_plugin, "slotToolActivated", Q_ARG(bool, false)));
    QVERIFY(QMetaObject::invokeMethod(m_plugin, "slotCurrentTemplateSelected", Q_ARG(int, 0)));
    QVERIFY(ZtStatusLog::getInstance()->entries().isEmpty());
    delete m_plugin;
}

/// Hosts may delete both in one go, with events for them still on the way.
void StatReportingPluginTest::diesBetweenEvents()
{
    for (const bool isPluginFirst : {true, false}) {
        restart();
        initialize();
        openModifiedEditor();
        click("theStatisticsButton");
        editor()->resize(editor()->width(), editor()->height() + 20);
        if (isPluginFirst)
            delete m_plugin;
        delete m_window;
        delete m_plugin;
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QCoreApplication::processEvents();
    }
}

void StatReportingPluginTest::endsWithItsHost_data()
{
    QTest::addColumn<QString>("order");
    for (const char *order : {"plugin window application", "window plugin application", "window application",
                              "plugin application", "application plugin", "application", "exit"})
        QTest::newRow(order) << QString::fromLatin1(order);
}

/// With both windows open and nothing deleted that is not named; started from a folder of no meaning, where
/// the host's libraries have to be found, too.
void StatReportingPluginTest::endsWithItsHost()
{
    QFETCH(QString, order);
    QProcess host;
    host.setWorkingDirectory(QDir::rootPath());
    host.start(QStringLiteral(STATREPORT_PLUGIN_HOST),
               QStringList(QStringLiteral(STATREPORT_PLUGIN)) + order.split(QLatin1Char(' ')));
    QVERIFY(host.waitForFinished());
    const QByteArray errors = host.readAllStandardError();
    QVERIFY2(host.exitStatus() == QProcess::NormalExit, errors.constData());
    QVERIFY2(host.exitCode() == 0, errors.constData());
    QVERIFY2(!errors.contains("QObject::"), errors.constData());
}

STATREPORT_TEST_MAIN(StatReportingPluginTest)
#include "StatReportingPluginTest.moc"
