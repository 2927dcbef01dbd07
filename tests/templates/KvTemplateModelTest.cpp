// SPDX-License-Identifier: MIT
#include "blocks/MetaMethods.h"
#include "report/KvFooterWidget.h"
#include "report/KvHeaderWidget.h"
#include "report/KvPageCountWidget.h"
#include "support/FakeReport.h"
#include "support/MessageBoxAnswerer.h"
#include "support/RightToLeft.h"
#include "support/StatReportTest.h"
#include "support/TemplateSignalLog.h"
#include "templates/KvUserMessages.h"

#include <QDir>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace {

/** Notes messages instead of showing them. */
class NotedMessages : public KvUserMessages
{
public:
    void warn(const QString &title, const QString &text) override { m_noted.append({title, text}); }
    const QVector<QPair<QString, QString>> &noted() const { return m_noted; }

private:
    QVector<QPair<QString, QString>> m_noted;
};

QString writeFile(const QString &name, const QByteArray &content)
{
    const QString path = StatReportTest::temporaryPath(name);
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly) || file.write(content) != content.size())
        qFatal("a test file cannot be written");
    return path;
}

QByteArray readFile(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArrayLiteral("(no file)");
}

// A template as its members' JSON texts; empty ones are left out.
QByteArray templateText(const QByteArray &nodes, const QByteArray &config = {},
                        const QByteArray &sections = {})
{
    QByteArrayList members;
    if (!config.isEmpty())
        members.append("\"config\": " + config);
    if (!sections.isEmpty())
        members.append(sections);
    if (!nodes.isEmpty())
        members.append("\"nodes\": " + nodes);
    return "{" + members.join(", ") + "}";
}

QByteArray fakeBlock(const QByteArray &heights)
{
    return R"({"name": "Fake", "config": {"heights": [)" + heights + "]}}";
}

QByteArray textBlock(const QByteArray &text)
{
    return R"({"name": "Text Document", "config": {"text": ")" + text + "\"}}";
}

// The blocks as "Fake 100,200" or "Text Document hello".
QStringList blocksOf(const KvTemplateModel *model)
{
    QStringList blocks;
    for (const KvReportNode *node : model->nodes()) {
        QString block = node->typeName();
        if (const auto *text = qobject_cast<const KvTextDocumentNodeCfg *>(node->config())) {
            block += QLatin1Char(' ') + text->text();
        } else if (const auto *fake = dynamic_cast<const FakeBlockCfg *>(node->config())) {
            QStringList heights;
            for (const int height : fake->heights())
                heights.append(QString::number(height));
            block += QLatin1Char(' ') + heights.join(QLatin1Char(','));
        }
        blocks.append(block);
    }
    return blocks;
}

// The text of an array of nodes is checked as numbers: "Fake" blocks of one piece, named by its height.
QVector<int> orderOf(const KvTemplateModel *model)
{
    QVector<int> order;
    for (KvReportNode *node : model->nodes())
        order.append(FakeReport::fakeCfg(node)->heights().value(0));
    return order;
}

const char kEmptyTemplate[] = R"({
    "config": {
        "marginWidth": 0.11999999731779099,
        "pageWidth": 952
    },
    "footer": {
        "enabled": false,
        "text": ""
    },
    "header": {
        "enabled": false,
        "text": ""
    },
    "nodes": [
    ],
    "pageNumbering": {
        "enabled": false,
        "text": ""
    }
}
)";

} // namespace

class KvTemplateModelTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void startsNew();
    void declaresItsMethodsInOrder();

    void loadSaysEverythingInOrder();
    void loadOverBlocksDeletesThemFirst();
    void loadOfTheCleanFileIsQuiet();
    void loadWithoutNodesKeepsTheBlocks();
    void loadWithoutSectionsDisablesThem();
    void readsNodes_data();
    void readsNodes();
    void readsOtherMembers_data();
    void readsOtherMembers();
    void aRefusedBlockLeavesAPartialModel_data();
    void aRefusedBlockLeavesAPartialModel();
    void unreadableFiles_data();
    void unreadableFiles();
    void loadingLastsUntilTheLastAnnouncement();

    void savesANewTemplate();
    void saveSaysEverythingInOrder();
    void saveReplacesALongerFile();
    void unwritableFiles_data();
    void unwritableFiles();
    void aFullDiskIsAFailure_data();
    void aFullDiskIsAFailure();
    void aBlockThatCannotBeWrittenLeavesAnEmptyFile();
    void roundTrip();

    void newTemplateStartsOver();
    void newTemplateOnANewOneSaysNoStatus();
    void printSaysWhetherItWorked();

    void appendsAndInserts();
    void createsBlocksByName_data();
    void createsBlocksByName();
    void createsNothingOfAnUnknownType();
    void moves_data();
    void moves();
    void removes();
    void clears();
    void notifies();
    void switchesSections();
    void theContextMarksModified();
    void makesSectionWidgets();
    void forwardsToTheContext();
    void messagesGoToTheInstalledObject();
    void messageTextsAreNoMarkup();
};

void KvTemplateModelTest::startsNew()
{
    KvReportKernelData data;
    KvTemplateModel model(nullptr, &data);
    QCOMPARE(model.context()->kernelData(), &data);
    QCOMPARE(model.nodeCount(), 0);
    QCOMPARE(model.filePath(), QString());
    QCOMPARE(model.isModified(), false);
    QCOMPARE(model.isLoading(), false);
    QCOMPARE(model.pageWidth(), 952);
    for (const KvPageSectionsCfg *section : {model.header(), model.footer(), model.pageNumbering()}) {
        QCOMPARE(section->context(), model.context());
        QCOMPARE(section->isEnabled(), false);
        QCOMPARE(section->text(), QString());
    }
    QVERIFY(!data.isActive());
    QVERIFY2(!model.createNode(QStringLiteral("Text Document"), -1), "no block types were set");
}

void KvTemplateModelTest::declaresItsMethodsInOrder()
{
    const QMetaObject &meta = KvTemplateModel::staticMetaObject;
    QCOMPARE(ownMethods(meta, QMetaMethod::Signal),
             QStringList({QStringLiteral("signalTemplateStatusChanged(QString,bool)"),
                          QStringLiteral("signalCloseAllEditors()"), QStringLiteral("signalListChanged()"),
                          QStringLiteral("signalBeforeDeleteNode(KvReportNode*)"),
                          QStringLiteral("signalHeaderStateChanged(bool)"),
                          QStringLiteral("signalFooterStateChanged(bool)"),
                          QStringLiteral("signalPageNumberingStateChanged(bool)")}));
    QCOMPARE(ownMethods(meta, QMetaMethod::Slot), QStringList(QStringLiteral("slotTemplateModified()")));

    // Arguments of spies and queued calls are looked up by the name in the signature.
    FakeReport report;
    KvReportNode *node = report.addFake({100});
    QSignalSpy spy(report.model(), SIGNAL(signalBeforeDeleteNode(KvReportNode*)));
    report.model()->removeNode(node);
    QCOMPARE(spy.count(), 1);
    // The node is gone, so that its address is all that may be looked at.
    QCOMPARE(*static_cast<KvReportNode *const *>(spy.at(0).at(0).constData()), node);
}

void KvTemplateModelTest::loadSaysEverythingInOrder()
{
    const QString path = writeFile(
        QStringLiteral("all.rtp"),
        templateText(
            "[" + textBlock("hello") + "," + fakeBlock("10,20") + "]",
            R"({"pageWidth": 600, "marginWidth": 0.25})",
            R"("header": {"text": "top", "enabled": true}, "footer": {"text": "bottom", "enabled": false},
                        "pageNumbering": {"text": "", "enabled": true})"));
    FakeReport report;
    TemplateSignalLog log(report.model());
    QVERIFY(report.model()->load(path));
    QCOMPARE(log.taken(), QStringList({QStringLiteral("header on"), QStringLiteral("footer"),
                                       QStringLiteral("numbering on"), QStringLiteral("list 0"),
                                       QStringLiteral("status '' modified"), QStringLiteral("list 1"),
                                       QStringLiteral("list 2"), QStringLiteral("status 'all.rtp'")}));
    QCOMPARE(report.model()->filePath(), path);
    QCOMPARE(report.model()->isModified(), false);
    QCOMPARE(report.model()->pageWidth(), 600);
    QCOMPARE(report.model()->context()->marginWidth(), 0.25f);
    QCOMPARE(report.model()->header()->text(), QStringLiteral("top"));
    QCOMPARE(report.model()->footer()->text(), QStringLiteral("bottom"));
    QCOMPARE(blocksOf(report.model()),
             QStringList({QStringLiteral("Text Document hello"), QStringLiteral("Fake 10,20")}));
    QCOMPARE(report.model()->node(1)->model(), report.model());
    QCOMPARE(report.model()->node(1)->context(), report.model()->context());
}

void KvTemplateModelTest::loadOverBlocksDeletesThemFirst()
{
    FakeReport report;
    report.addText(QStringLiteral("old"));
    report.addFake({1});
    const QString path = writeFile(QStringLiteral("over.rtp"), templateText("[" + fakeBlock("7") + "]"));
    TemplateSignalLog log(report.model());
    QVERIFY(report.model()->load(path));
    // The model was modified before, so the first new block says nothing of it.
    QCOMPARE(log.taken(), QStringList({QStringLiteral("header"), QStringLiteral("footer"),
                                       QStringLiteral("numbering"), QStringLiteral("delete Text Document"),
                                       QStringLiteral("delete Fake"), QStringLiteral("list 0"),
                                       QStringLiteral("list 1"), QStringLiteral("status 'over.rtp'")}));
    QCOMPARE(blocksOf(report.model()), QStringList(QStringLiteral("Fake 7")));
}

void KvTemplateModelTest::loadOfTheCleanFileIsQuiet()
{
    const QString path = writeFile(QStringLiteral("quiet.rtp"), templateText("[]"));
    FakeReport report;
    QVERIFY(report.model()->load(path));
    TemplateSignalLog log(report.model());
    QVERIFY(report.model()->load(path));
    QCOMPARE(log.taken(), QStringList({QStringLiteral("header"), QStringLiteral("footer"),
                                       QStringLiteral("numbering"), QStringLiteral("list 0")}));
}

void KvTemplateModelTest::loadWithoutNodesKeepsTheBlocks()
{
    for (const QByteArray &nodes : {QByteArray(), QByteArray("{}"), QByteArray("5"), QByteArray("\"x\""),
                                    QByteArray("null"), QByteArray("true")}) {
        FakeReport report;
        report.addFake({1});
        report.addFake({2});
        const QString path =
            writeFile(QStringLiteral("nonodes.rtp"), templateText(nodes, R"({"pageWidth": 700})"));
        TemplateSignalLog log(report.model());
        QVERIFY(report.model()->load(path));
        QCOMPARE(log.taken(),
                 QStringList({QStringLiteral("header"), QStringLiteral("footer"), QStringLiteral("numbering"),
                              QStringLiteral("status 'nonodes.rtp'")}));
        QCOMPARE(orderOf(report.model()), QVector<int>({1, 2}));
        QCOMPARE(report.model()->pageWidth(), 700);
        QCOMPARE(report.model()->filePath(), path);
        QCOMPARE(report.model()->isModified(), false);
    }
}

void KvTemplateModelTest::loadWithoutSectionsDisablesThem()
{
    FakeReport report;
    const QString path = temporaryPath(QStringLiteral("keeps-text.rtp"));
    for (KvPageSectionsCfg *section :
         {report.model()->header(), report.model()->footer(), report.model()->pageNumbering()}) {
        section->setText(QStringLiteral("old text"));
        section->setEnabled(true);
    }
    QVERIFY(report.model()->load(writeFile(QStringLiteral("nosections.rtp"), "{}")));
    QVERIFY(report.model()->save(path));
    const QJsonObject root = QJsonDocument::fromJson(readFile(path)).object();
    const QJsonObject expected{{QStringLiteral("enabled"), false},
                               {QStringLiteral("text"), QStringLiteral("old text")}};
    QCOMPARE(root.value(QStringLiteral("header")).toObject(), expected);
    QCOMPARE(root.value(QStringLiteral("footer")).toObject(), expected);
    QCOMPARE(root.value(QStringLiteral("pageNumbering")).toObject(), expected);
}

void KvTemplateModelTest::readsNodes_data()
{
    QTest::addColumn<QByteArray>("nodes");
    QTest::addColumn<QStringList>("blocks");

    const QByteArray good = fakeBlock("5");
    const QStringList five{QStringLiteral("Fake 5")};
    QTest::newRow("none") << QByteArray("[]") << QStringList();
    QTest::newRow("one") << QByteArray("[" + good + "]") << five;
    QTest::newRow("same type twice") << QByteArray("[" + good + "," + fakeBlock("6") + "]")
                                     << QStringList({QStringLiteral("Fake 5"), QStringLiteral("Fake 6")});
    QTest::newRow("elements that are no objects")
        << QByteArray("[1, \"x\", null, true, [], [" + good + "], 2.5, " + good + "]") << five;
    QTest::newRow("empty object") << QByteArray("[{}, " + good + "]") << five;
    QTest::newRow("name missing") << QByteArray(R"([{"config": {"heights": []}}, )" + good + "]") << five;
    for (const char *name : {"5", "null", "true", "{}", "[\"Fake\"]"}) {
        QTest::addRow("name is %s", name) << QByteArray(R"([{"name": )" + QByteArray(name) +
                                                        R"(, "config": {"heights": []}}, )" + good + "]")
                                          << five;
    }
    for (const char *name : {"", "fake", "FAKE", "Fake ", "Fake title", "Measurements Table", "Pony"}) {
        QTest::addRow("name '%s' is unknown", name)
            << QByteArray("[" + good + R"(, {"name": ")" + QByteArray(name) + R"(", "config": {}}, )" +
                          fakeBlock("6") + "]")
            << QStringList({QStringLiteral("Fake 5"), QStringLiteral("Fake 6")});
    }
    // A block of an unknown type is not asked for its config.
    QTest::newRow("unknown without config") << QByteArray(R"([{"name": "Pony"}, )" + good + "]") << five;
    QTest::newRow("only unknown") << QByteArray(R"([{"name": "Pony", "config": {}}, 1])") << QStringList();
    QTest::newRow("unknown at the end")
        << QByteArray("[" + good + R"(, {"name": "Pony", "config": {}}])") << five;
    QTest::newRow("title beside the name")
        << QByteArray(R"([{"name": "Fake", "title": "Pony", "config": {"heights": [5]}}])") << five;
    QTest::newRow("title instead of the name")
        << QByteArray(R"([{"title": "Fake", "config": {"heights": [5]}}, )" + good + "]") << five;
}

void KvTemplateModelTest::readsNodes()
{
    QFETCH(QByteArray, nodes);
    FakeReport report;
    report.addFake({99});
    const QString path = writeFile(QStringLiteral("nodes.rtp"), templateText(nodes));
    QVERIFY(report.model()->load(path));
    QTEST(blocksOf(report.model()), "blocks");
    QCOMPARE(report.model()->filePath(), path);
    QCOMPARE(report.model()->isModified(), false);
    QCOMPARE(report.model()->isLoading(), false);
}

void KvTemplateModelTest::readsOtherMembers_data()
{
    QTest::addColumn<QByteArray>("root");
    QTest::addColumn<int>("pageWidth");
    QTest::addColumn<float>("margin");
    QTest::addColumn<bool>("header");
    QTest::addColumn<QString>("headerText");

    const QString old = QStringLiteral("old");
    const auto row = [&old](const char *name, const QByteArray &text, int width = 700, float margin = 0.5f,
                            bool header = false, const QString &headerText = QString()) {
        QTest::newRow(name) << text << width << margin << header << (headerText.isNull() ? old : headerText);
    };
    row("empty object", "{}");
    for (const char *value : {"5", "\"x\"", "[]", "[{}]", "null", "true"}) {
        row(qPrintable(QStringLiteral("config is %1").arg(QLatin1String(value))),
            "{\"config\": " + QByteArray(value) + "}");
        row(qPrintable(QStringLiteral("header is %1").arg(QLatin1String(value))),
            "{\"header\": " + QByteArray(value) + "}");
    }
    row("empty config", R"({"config": {}})");
    row("page width 952.5", R"({"config": {"pageWidth": 952.5}})", 0);
    row("page width \"952\"", R"({"config": {"pageWidth": "952"}})", 0);
    row("page width null", R"({"config": {"pageWidth": null}})", 0);
    row("page width 3e9", R"({"config": {"pageWidth": 3e9}})", 0);
    row("page width -5", R"({"config": {"pageWidth": -5}})", -5);
    row("page width 0", R"({"config": {"pageWidth": 0}})", 0);
    row("page width 10", R"({"config": {"pageWidth": 10}})", 10);
    row("page width 40.0", R"({"config": {"pageWidth": 40.0}})", 40);
    row("margin of a text", R"({"config": {"marginWidth": "0.1"}})", 700, 0.0f);
    row("margin null", R"({"config": {"marginWidth": null}})", 700, 0.0f);
    row("huge margin", R"({"config": {"marginWidth": 1e30}})", 700, 1e30f);
    row("header on", R"({"header": {"enabled": true, "text": "new"}})", 700, 0.5f, true,
        QStringLiteral("new"));
    row("header on without text", R"({"header": {"enabled": true}})");
    row("header 1", R"({"header": {"enabled": 1, "text": "new"}})", 700, 0.5f, false, QStringLiteral("new"));
    row("header text 5", R"({"header": {"enabled": true, "text": 5}})");
    row("unknown members", R"({"version": 3, "config": {"contentHeight": 3}})");
}

void KvTemplateModelTest::readsOtherMembers()
{
    QFETCH(QByteArray, root);
    FakeReport report;
    KvTemplateModel *model = report.model();
    model->setPageWidth(700);
    model->context()->setMarginWidth(0.5f);
    model->header()->setText(QStringLiteral("old"));
    model->setHeaderEnabled(true);
    QVERIFY(model->load(writeFile(QStringLiteral("members.rtp"), root)));
    QTEST(model->pageWidth(), "pageWidth");
    QTEST(model->context()->marginWidth(), "margin");
    QTEST(model->isHeaderEnabled(), "header");
    QTEST(model->header()->text(), "headerText");
    QCOMPARE(model->context()->contentHeight(), 1346);
}

void KvTemplateModelTest::aRefusedBlockLeavesAPartialModel_data()
{
    QTest::addColumn<QByteArray>("nodes");
    QTest::addColumn<QStringList>("blocks");
    QTest::addColumn<QStringList>("tail"); // of the log, from the new list on, for a clean model

    const QStringList five{QStringLiteral("Fake 5")};
    const QStringList afterOne{QStringLiteral("list 0"), QStringLiteral("status '' modified"),
                               QStringLiteral("list 1"), QStringLiteral("status ''")};
    const QByteArray good = fakeBlock("5");
    QTest::newRow("refused") << QByteArray("[" + good + R"(, {"name": "Fake", "config": {}}, )" + good + "]")
                             << five << afterOne;
    QTest::newRow("no config") << QByteArray("[" + good + R"(, {"name": "Fake"}])") << five << afterOne;
    for (const char *config : {"5", "\"x\"", "null", "[]", "true"}) {
        QTest::addRow("config is %s", config)
            << QByteArray("[" + good + R"(, {"name": "Fake", "config": )" + QByteArray(config) + "}]") << five
            << afterOne;
    }
    QTest::newRow("first refused") << QByteArray(R"([{"name": "Fake", "config": {}}, )" + good + "]")
                                   << QStringList() << QStringList(QStringLiteral("list 0"));
    QTest::newRow("text without text")
        << QByteArray("[" + good + R"(, {"name": "Text Document", "config": {}}])") << five << afterOne;
}

void KvTemplateModelTest::aRefusedBlockLeavesAPartialModel()
{
    QFETCH(QByteArray, nodes);
    QFETCH(QStringList, tail);
    const QString path =
        writeFile(QStringLiteral("refused.rtp"), templateText(nodes, R"({"pageWidth": 600})"));
    const QStringList sections{QStringLiteral("header"), QStringLiteral("footer"),
                               QStringLiteral("numbering")};
    const MessageBoxAnswerer answerer;

    FakeReport clean;
    TemplateSignalLog log(clean.model());
    QVERIFY(!clean.model()->load(path));
    QTEST(blocksOf(clean.model()), "blocks");
    QCOMPARE(log.taken(), sections + tail);
    QCOMPARE(clean.model()->filePath(), QString());
    QCOMPARE(clean.model()->isModified(), false);
    QCOMPARE(clean.model()->isLoading(), false);
    QCOMPARE(clean.model()->pageWidth(), 600);

    FakeReport modified;
    modified.addFake({1});
    QVERIFY(!modified.model()->load(path));
    QTEST(blocksOf(modified.model()), "blocks");
    QCOMPARE(modified.model()->filePath(), QString());
    QCOMPARE(modified.model()->isModified(), true);

    QCOMPARE(answerer.boxes().size(), 0);
}

void KvTemplateModelTest::unreadableFiles_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("title"); // empty for a failure without a message
    QTest::addColumn<QString>("text");

    const QString cannotRead = QStringLiteral("Cannot read");
    const QString cannotOpen = QStringLiteral("Cannot open file %1");
    const QString readError = QStringLiteral("Error reading file");
    const QString cannotReadFile = QStringLiteral("Cannot read file %1");

    QTest::newRow("missing") << temporaryPath(QStringLiteral("missing.rtp")) << cannotRead << cannotOpen;
    QTest::newRow("missing folder") << temporaryPath(QStringLiteral("none/missing.rtp")) << cannotRead
                                    << cannotOpen;
    QTest::newRow("empty path") << QString() << cannotRead << cannotOpen;
    QTest::newRow("place marker in the path")
        << temporaryPath(QStringLiteral("%1 and %2.rtp")) << cannotRead << cannotOpen;
    QTest::newRow("folder") << QDir::tempPath() << cannotRead << cannotOpen;

    const auto broken = [&](const char *name, const QByteArray &content) {
        QTest::newRow(name) << writeFile(QStringLiteral("broken-%1.rtp").arg(QLatin1String(name)), content)
                            << readError << cannotReadFile;
    };
    broken("empty", "");
    broken("scalar", "1");
    broken("text", "\"text\"");
    broken("null", "null");
    broken("truncated", R"({"config": {"pageWidth": 952)");
    broken("trailing", "{} x");
    broken("comma", "{\"config\": {},}");
    broken("binary", QByteArray("\x00\xff\x1f\x8b", 4));
    broken("nested", QByteArray(5000, '[') + QByteArray(5000, ']'));
    QByteArray nestedNodes = "{\"nodes\": ";
    for (int i = 0; i < 5000; ++i)
        nestedNodes += "[{\"config\": ";
    broken("nested nodes", nestedNodes);

    QTest::newRow("array") << writeFile(QStringLiteral("array.rtp"), "[]") << QString() << QString();
    QTest::newRow("array of objects")
        << writeFile(QStringLiteral("array2.rtp"), "[{\"nodes\": []}]") << QString() << QString();
}

void KvTemplateModelTest::unreadableFiles()
{
    QFETCH(QString, path);
    QFETCH(QString, title);
    QFETCH(QString, text);

    FakeReport report;
    report.addFake({5});
    report.model()->header()->setText(QStringLiteral("old"));
    TemplateSignalLog log(report.model());
    const MessageBoxAnswerer answerer;
    if (path.isEmpty())
        expectWarning(QRegularExpression(QStringLiteral("^QFSFileEngine::open: No file name specified$")));
    QVERIFY(!report.model()->load(path));
    QCOMPARE(log.taken(), QStringList());
    QCOMPARE(orderOf(report.model()), QVector<int>({5}));
    QCOMPARE(report.model()->header()->text(), QStringLiteral("old"));
    QCOMPARE(report.model()->filePath(), QString());

    if (title.isEmpty()) {
        QCOMPARE(answerer.boxes().size(), 0);
        return;
    }
    QCOMPARE(answerer.boxes().size(), 1);
    const SeenMessageBox &box = answerer.boxes().first();
    QCOMPARE(box.title, title);
    QCOMPARE(box.text, text.replace(QLatin1String("%1"), path));
    QCOMPARE(box.icon, QMessageBox::Warning);
    QCOMPARE(box.buttons, QMessageBox::StandardButtons(QMessageBox::Ok));
    QVERIFY(box.isModal);
    QVERIFY(!box.hasParent);
}

void KvTemplateModelTest::loadingLastsUntilTheLastAnnouncement()
{
    struct Case
    {
        QByteArray nodes;
        QVector<bool> loading; // at each announcement of sections and list
    };
    const QVector<Case> cases{
        {"[" + fakeBlock("1") + "," + fakeBlock("2") + "]", {true, true, true, true, true, false}},
        {"[" + fakeBlock("1") + R"(, {"name": "Pony"}])", {true, true, true, true, false}},
        {"[" + fakeBlock("1") + R"(, {"name": "Fake"}])", {true, true, true, true, false}},
        {"[]", {true, true, true, false}},
        {R"([{"name": "Fake"}])", {true, true, true, false}},
        {"", {true, true, false}}};
    for (const Case &testCase : cases) {
        FakeReport report;
        KvTemplateModel *model = report.model();
        QVector<bool> loading;
        const auto note = [&loading, model]() { loading.append(model->isLoading()); };
        connect(model, &KvTemplateModel::signalListChanged, this, note);
        connect(model, &KvTemplateModel::signalHeaderStateChanged, this, note);
        connect(model, &KvTemplateModel::signalFooterStateChanged, this, note);
        connect(model, &KvTemplateModel::signalPageNumberingStateChanged, this, note);
        model->load(writeFile(QStringLiteral("loading.rtp"), templateText(testCase.nodes)));
        QVERIFY2(loading == testCase.loading, testCase.nodes.constData());
    }
}

void KvTemplateModelTest::savesANewTemplate()
{
    FakeReport report;
    const QString path = temporaryPath(QStringLiteral("new.rtp"));
    QVERIFY(report.model()->save(path));
    QCOMPARE(QString::fromUtf8(readFile(path)), QString::fromUtf8(kEmptyTemplate));
}

void KvTemplateModelTest::saveSaysEverythingInOrder()
{
    FakeReport report;
    report.addText(QStringLiteral("hello"));
    report.addFake({10, 20});
    report.model()->setFooterEnabled(true);
    TemplateSignalLog log(report.model());
    const QString path = temporaryPath(QStringLiteral("order.rtp"));
    QVERIFY(report.model()->save(path));
    QCOMPARE(log.taken(),
             QStringList({QStringLiteral("close editors"), QStringLiteral("status 'order.rtp'")}));
    QCOMPARE(report.model()->filePath(), path);
    QCOMPARE(report.model()->isModified(), false);
    QVERIFY(report.model()->save(path));
    QCOMPARE(log.taken(), QStringList(QStringLiteral("close editors")));

    const QString other = temporaryPath(QStringLiteral("other.rtp"));
    QVERIFY(report.model()->save(other));
    QCOMPARE(log.taken(),
             QStringList({QStringLiteral("close editors"), QStringLiteral("status 'other.rtp'")}));

    const QByteArray expected = R"({"config": {"marginWidth": 0.11999999731779099, "pageWidth": 952},
        "header": {"enabled": false, "text": ""}, "footer": {"enabled": true, "text": ""},
        "pageNumbering": {"enabled": false, "text": ""},
        "nodes": [{"name": "Text Document", "config": {"text": "hello"}},
                  {"name": "Fake", "config": {"heights": [10, 20]}}]})";
    QCOMPARE(QJsonDocument::fromJson(readFile(path)), QJsonDocument::fromJson(expected));
}

void KvTemplateModelTest::saveReplacesALongerFile()
{
    FakeReport report;
    const QString path = writeFile(QStringLiteral("long.rtp"), QByteArray(100000, 'x'));
    QVERIFY(report.model()->save(path));
    QCOMPARE(QString::fromUtf8(readFile(path)), QString::fromUtf8(kEmptyTemplate));
}

void KvTemplateModelTest::unwritableFiles_data()
{
    QTest::addColumn<QString>("path");
    QTest::newRow("missing folder") << temporaryPath(QStringLiteral("none/file.rtp"));
    QTest::newRow("folder") << QDir::tempPath();
    QTest::newRow("empty path") << QString();
}

void KvTemplateModelTest::unwritableFiles()
{
    QFETCH(QString, path);
    FakeReport report;
    report.addFake({5});
    TemplateSignalLog log(report.model());
    const MessageBoxAnswerer answerer;
    if (path.isEmpty())
        expectWarning(QRegularExpression(QStringLiteral("^QFSFileEngine::open: No file name specified$")));
    QVERIFY(!report.model()->save(path));
    QCOMPARE(log.taken(), QStringList(QStringLiteral("close editors")));
    QCOMPARE(report.model()->isModified(), true);
    QCOMPARE(report.model()->filePath(), QString());
    QCOMPARE(answerer.boxes().size(), 1);
    QCOMPARE(answerer.boxes().first().title, QStringLiteral("Cannot save"));
    QCOMPARE(answerer.boxes().first().text, QStringLiteral("Cannot create file ") + path);
    QCOMPARE(answerer.boxes().first().icon, QMessageBox::Warning);
    QCOMPARE(answerer.boxes().first().buttons, QMessageBox::StandardButtons(QMessageBox::Ok));
    QVERIFY(answerer.boxes().first().isModal);
    QVERIFY(!answerer.boxes().first().hasParent);
}

void KvTemplateModelTest::aFullDiskIsAFailure_data()
{
    QTest::addColumn<int>("textLength");
    QTest::newRow("less than a buffer") << 10;
    QTest::newRow("more than a buffer") << 1000000;
}

void KvTemplateModelTest::aFullDiskIsAFailure()
{
    const QString path = QStringLiteral("/dev/full");
    QVERIFY2(QFile::exists(path), "this system has no device that is always full");
    QFETCH(int, textLength);
    FakeReport report;
    report.addText(QString(textLength, QLatin1Char('x')));
    const MessageBoxAnswerer answerer;
    QVERIFY(!report.model()->save(path));
    QCOMPARE(report.model()->isModified(), true);
    QCOMPARE(report.model()->filePath(), QString());
    QCOMPARE(answerer.boxes().size(), 0);
}

void KvTemplateModelTest::aBlockThatCannotBeWrittenLeavesAnEmptyFile()
{
    FakeReport report;
    report.addFake({1});
    FakeReport::fakeCfg(report.addFake({2}))->setWritable(false);
    const QString path = writeFile(QStringLiteral("unwritable.rtp"), "{\"was\": \"here\"}");
    TemplateSignalLog log(report.model());
    const MessageBoxAnswerer answerer;
    QVERIFY(!report.model()->save(path));
    QCOMPARE(QFileInfo(path).size(), 0LL);
    QCOMPARE(log.taken(), QStringList(QStringLiteral("close editors")));
    QCOMPARE(report.model()->isModified(), true);
    QCOMPARE(report.model()->filePath(), QString());
    QCOMPARE(answerer.boxes().size(), 0);
}

void KvTemplateModelTest::roundTrip()
{
    FakeReport report;
    KvTemplateModel *model = report.model();
    report.addText(QStringLiteral("<p>Größe \"quoted\" \\ 大きさ 😀</p>\n"));
    report.addFake({});
    report.addFake({1, -1, 30000});
    report.addTable();
    model->setPageWidth(1276);
    model->context()->setMarginWidth(0.07f);
    model->header()->setText(QStringLiteral("${CREATION_DATE_ISO}"));
    model->setHeaderEnabled(true);
    model->footer()->setText(QStringLiteral("kept while off"));
    model->setPageNumberingEnabled(true);
    const QString first = temporaryPath(QStringLiteral("first.rtp"));
    QVERIFY(model->save(first));

    FakeReport other;
    QVERIFY(other.model()->load(first));
    QCOMPARE(blocksOf(other.model()), blocksOf(model));
    QCOMPARE(other.model()->nodeCount(), 4);
    QCOMPARE(other.model()->pageWidth(), 1276);
    QCOMPARE(other.model()->context()->marginWidth(), 0.07f);
    QCOMPARE(other.model()->header()->text(), QStringLiteral("${CREATION_DATE_ISO}"));
    QCOMPARE(other.model()->isHeaderEnabled(), true);
    QCOMPARE(other.model()->footer()->text(), QStringLiteral("kept while off"));
    QCOMPARE(other.model()->isFooterEnabled(), false);
    QCOMPARE(other.model()->isPageNumberingEnabled(), true);

    const QString second = temporaryPath(QStringLiteral("second.rtp"));
    QVERIFY(other.model()->save(second));
    // Compared as values: a table lists its columns in no fixed order.
    QJsonObject firstRoot = QJsonDocument::fromJson(readFile(first)).object();
    QJsonObject secondRoot = QJsonDocument::fromJson(readFile(second)).object();
    QJsonArray firstNodes = firstRoot.take(QStringLiteral("nodes")).toArray();
    QJsonArray secondNodes = secondRoot.take(QStringLiteral("nodes")).toArray();
    QCOMPARE(firstRoot, secondRoot);
    firstNodes.removeLast();
    secondNodes.removeLast();
    QCOMPARE(firstNodes, secondNodes);
}

void KvTemplateModelTest::newTemplateStartsOver()
{
    FakeReport report;
    KvTemplateModel *model = report.model();
    QVERIFY(model->load(writeFile(QStringLiteral("before.rtp"),
                                  templateText("[" + textBlock("a") + "," + fakeBlock("1") + "]",
                                               R"({"pageWidth": 600, "marginWidth": 0.25})",
                                               R"("header": {"text": "top", "enabled": true})"))));
    TemplateSignalLog log(model);
    const QPointer<KvPageSectionsCfg> oldHeader(model->header());
    bool oldAliveAtSignal = false;
    connect(model, &KvTemplateModel::signalHeaderStateChanged, this,
            [&oldAliveAtSignal, &oldHeader]() { oldAliveAtSignal = !oldHeader.isNull(); });

    QVERIFY(model->newTemplate());
    QCOMPARE(log.taken(),
             QStringList({QStringLiteral("delete Text Document"), QStringLiteral("delete Fake"),
                          QStringLiteral("list 0"), QStringLiteral("header"), QStringLiteral("footer"),
                          QStringLiteral("numbering"), QStringLiteral("status ''")}));
    QCOMPARE(model->nodeCount(), 0);
    QCOMPARE(model->pageWidth(), 952);
    QCOMPARE(model->context()->marginWidth(), 0.12f);
    QCOMPARE(model->filePath(), QString());
    QCOMPARE(model->isModified(), false);
    QCOMPARE(model->header()->text(), QString());
    QCOMPARE(model->header()->context(), model->context());
    QVERIFY2(oldAliveAtSignal, "pages show the old section until they are told");
    QVERIFY(oldHeader.isNull());
}

void KvTemplateModelTest::newTemplateOnANewOneSaysNoStatus()
{
    FakeReport report;
    TemplateSignalLog log(report.model());
    QVERIFY(report.model()->newTemplate());
    const QStringList quiet{QStringLiteral("list 0"), QStringLiteral("header"), QStringLiteral("footer"),
                            QStringLiteral("numbering")};
    QCOMPARE(log.taken(), quiet);
    report.model()->slotTemplateModified();
    log.taken();
    QVERIFY(report.model()->newTemplate());
    QCOMPARE(log.taken(), quiet + QStringList(QStringLiteral("status ''")));
}

void KvTemplateModelTest::printSaysWhetherItWorked()
{
    FakeReport report;
    report.addFake({100});
    TemplateSignalLog log(report.model());
    const QString path = temporaryPath(QStringLiteral("model.pdf"));
    QCOMPARE(report.model()->print(path), 1);
    QCOMPARE(log.taken(), QStringList(QStringLiteral("close editors")));
    QVERIFY(QFileInfo(path).size() > 0);
    const MessageBoxAnswerer answerer;
    expectWarning(QRegularExpression(QStringLiteral("^QPainter::begin\\(\\): Returned false$")));
    QCOMPARE(report.model()->print(temporaryPath(QStringLiteral("none/model.pdf"))), 0);
    QCOMPARE(log.taken(), QStringList(QStringLiteral("close editors")));
    QCOMPARE(answerer.boxes().size(), 0);
    QCOMPARE(report.model()->nodeCount(), 1);
}

void KvTemplateModelTest::appendsAndInserts()
{
    FakeReport report;
    KvTemplateModel *model = report.model();
    TemplateSignalLog log(model);
    report.addFake({1});
    QCOMPARE(log.taken(), QStringList({QStringLiteral("status '' modified"), QStringLiteral("list 1")}));
    report.addFake({2});
    QCOMPARE(log.taken(), QStringList(QStringLiteral("list 2")));

    const auto insert = [&report, model](int index, int height) {
        auto *node = new KvReportNode(nullptr, report.fakeFactory(), model->context(), model);
        FakeReport::fakeCfg(node)->setHeights({height});
        model->insertNode(index, node);
        return node;
    };
    insert(0, 3);
    QCOMPARE(orderOf(model), QVector<int>({3, 1, 2}));
    insert(3, 4);
    QCOMPARE(orderOf(model), QVector<int>({3, 1, 2, 4}));
    insert(1, 5);
    QCOMPARE(orderOf(model), QVector<int>({3, 5, 1, 2, 4}));
    insert(99, 6);
    QCOMPARE(orderOf(model), QVector<int>({3, 5, 1, 2, 4, 6}));
    insert(-1, 7);
    QCOMPARE(orderOf(model), QVector<int>({3, 5, 1, 2, 4, 6, 7}));
    QCOMPARE(log.taken(),
             QStringList({QStringLiteral("list 3"), QStringLiteral("list 4"), QStringLiteral("list 5"),
                          QStringLiteral("list 6"), QStringLiteral("list 7")}));

    const std::unique_ptr<KvReportNode> refused(insert(-2, 8));
    QCOMPARE(orderOf(model), QVector<int>({3, 5, 1, 2, 4, 6, 7}));
    QCOMPARE(log.taken(), QStringList());
}

void KvTemplateModelTest::createsBlocksByName_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<int>("place");
    QTest::newRow("appended") << -1 << 2;
    QTest::newRow("first") << 0 << 0;
    QTest::newRow("between") << 1 << 1;
    QTest::newRow("at the end") << 2 << 2;
    QTest::newRow("beyond the end") << 3 << 2;
    QTest::newRow("negative") << -2 << -1;
}

void KvTemplateModelTest::createsBlocksByName()
{
    QFETCH(int, index);
    QFETCH(int, place);
    FakeReport report;
    report.addFake({1});
    report.addFake({2});
    TemplateSignalLog log(report.model());
    KvReportNode *node = report.model()->createNode(QStringLiteral("Text Document"), index);
    QCOMPARE(report.model()->nodes().indexOf(node), place);
    QCOMPARE(report.model()->nodeCount(), place < 0 ? 2 : 3);
    QCOMPARE(log.taken(), place < 0 ? QStringList() : QStringList(QStringLiteral("list 3")));
    if (node) {
        QCOMPARE(node->typeName(), QStringLiteral("Text Document"));
        QCOMPARE(node->model(), report.model());
        QCOMPARE(node->context(), report.model()->context());
        QCOMPARE(node->config()->context(), report.model()->context());
    }
}

void KvTemplateModelTest::createsNothingOfAnUnknownType()
{
    FakeReport report;
    TemplateSignalLog log(report.model());
    for (const char *name : {"", "Pony", "fake", "Fake title", "text document"})
        QVERIFY2(!report.model()->createNode(QLatin1String(name), -1), name);
    QCOMPARE(log.taken(), QStringList());
    QCOMPARE(report.model()->nodeCount(), 0);
    QCOMPARE(report.model()->isModified(), false);
}

void KvTemplateModelTest::moves_data()
{
    QTest::addColumn<int>("from");
    QTest::addColumn<int>("to");
    QTest::addColumn<QVector<int>>("order");

    const QVector<int> same{1, 2, 3, 4};
    QTest::newRow("2 to 2") << 2 << 2 << same;
    QTest::newRow("first to last") << 0 << -1 << QVector<int>({2, 3, 4, 1});
    QTest::newRow("first to 3") << 0 << 3 << QVector<int>({2, 3, 4, 1});
    QTest::newRow("last to first") << 3 << 0 << QVector<int>({4, 1, 2, 3});
    QTest::newRow("last to last") << 3 << -1 << same;
    QTest::newRow("down by two") << 1 << 3 << QVector<int>({1, 3, 4, 2});
    QTest::newRow("up by one") << 2 << 1 << QVector<int>({1, 3, 2, 4});
    QTest::newRow("from beyond the end") << 4 << 0 << same;
    QTest::newRow("to beyond the end") << 0 << 4 << same;
    QTest::newRow("from -1") << -1 << 0 << same;
    QTest::newRow("to -2") << 0 << -2 << same;
}

void KvTemplateModelTest::moves()
{
    QFETCH(int, from);
    QFETCH(int, to);
    FakeReport report;
    for (int i = 1; i <= 4; ++i)
        report.addFake({i});
    QVERIFY(report.model()->save(temporaryPath(QStringLiteral("moves.rtp"))));
    TemplateSignalLog log(report.model());
    report.model()->moveNode(from, to);
    QTEST(orderOf(report.model()), "order");
    QCOMPARE(log.taken(), QStringList());
    QCOMPARE(report.model()->isModified(), false);
}

void KvTemplateModelTest::removes()
{
    FakeReport report;
    KvTemplateModel *model = report.model();
    const QPointer<KvReportNode> first(report.addFake({1}));
    report.addFake({2});
    model->slotTemplateModified();
    QVERIFY(model->save(temporaryPath(QStringLiteral("removes.rtp"))));
    TemplateSignalLog log(model);
    bool aliveWhenAnnounced = false;
    connect(model, &KvTemplateModel::signalBeforeDeleteNode, this,
            [&aliveWhenAnnounced, &first]() { aliveWhenAnnounced = !first.isNull(); });
    model->removeNode(first);
    QCOMPARE(log.taken(),
             QStringList({QStringLiteral("delete Fake"), QStringLiteral("status 'removes.rtp' modified"),
                          QStringLiteral("list 1")}));
    QVERIFY(aliveWhenAnnounced);
    QVERIFY(first.isNull());
    QCOMPARE(orderOf(model), QVector<int>({2}));

    model->removeNode(nullptr);
    KvReportNode stranger(nullptr, report.fakeFactory(), model->context());
    model->removeNode(&stranger);
    QCOMPARE(log.taken(), QStringList());

    // A block that was appended twice by mistake leaves no dead pointer behind.
    KvReportNode *twice = report.addFake({3});
    model->appendNode(twice);
    model->removeNode(twice);
    QCOMPARE(orderOf(model), QVector<int>({2}));
}

void KvTemplateModelTest::clears()
{
    FakeReport report;
    KvTemplateModel *model = report.model();
    TemplateSignalLog log(model);
    model->clearNodes();
    QCOMPARE(log.taken(), QStringList(QStringLiteral("list 0")));
    QCOMPARE(model->isModified(), false);

    report.addText(QStringLiteral("a"));
    report.addFake({1});
    QVERIFY(model->save(temporaryPath(QStringLiteral("clears.rtp"))));
    log.taken();
    const QPointer<KvReportNode> node(model->node(0));
    model->clearNodes();
    QCOMPARE(log.taken(), QStringList({QStringLiteral("delete Text Document"), QStringLiteral("delete Fake"),
                                       QStringLiteral("list 0")}));
    QVERIFY(node.isNull());
    QCOMPARE(model->isModified(), false);
}

void KvTemplateModelTest::notifies()
{
    FakeReport report;
    TemplateSignalLog log(report.model());
    report.model()->notifyListChanged();
    QCOMPARE(log.taken(), QStringList(QStringLiteral("list 0")));
    QCOMPARE(report.model()->isModified(), false);
}

void KvTemplateModelTest::switchesSections()
{
    FakeReport report;
    KvTemplateModel *model = report.model();
    TemplateSignalLog log(model);
    struct Section
    {
        void (KvTemplateModel::*set)(bool);
        bool (KvTemplateModel::*get)() const;
        QString name;
    };
    const QVector<Section> sections{
        {&KvTemplateModel::setHeaderEnabled, &KvTemplateModel::isHeaderEnabled, QStringLiteral("header")},
        {&KvTemplateModel::setFooterEnabled, &KvTemplateModel::isFooterEnabled, QStringLiteral("footer")},
        {&KvTemplateModel::setPageNumberingEnabled, &KvTemplateModel::isPageNumberingEnabled,
         QStringLiteral("numbering")}};
    for (const Section &section : sections) {
        QVERIFY(model->newTemplate());
        log.taken();
        (model->*section.set)(false);
        QCOMPARE(log.taken(), QStringList());
        (model->*section.set)(true);
        QCOMPARE(log.taken(),
                 QStringList({section.name + QStringLiteral(" on"), QStringLiteral("status '' modified")}));
        QVERIFY((model->*section.get)());
        (model->*section.set)(true);
        QCOMPARE(log.taken(), QStringList());
        (model->*section.set)(false);
        QCOMPARE(log.taken(), QStringList(section.name));
        QVERIFY(!(model->*section.get)());
        QVERIFY(model->isModified());
    }
}

void KvTemplateModelTest::theContextMarksModified()
{
    FakeReport report;
    QVERIFY(report.model()->save(temporaryPath(QStringLiteral("context.rtp"))));
    TemplateSignalLog log(report.model());
    emit report.model()->context()->signalTemplateModified();
    emit report.model()->context()->signalTemplateModified();
    QCOMPARE(log.taken(), QStringList(QStringLiteral("status 'context.rtp' modified")));
    QVERIFY(report.model()->isModified());
}

void KvTemplateModelTest::makesSectionWidgets()
{
    QWidget displayParent;
    KvTemplateModel model(&displayParent, nullptr);
    model.header()->setText(QStringLiteral("top"));
    model.footer()->setText(QStringLiteral("bottom"));
    const std::unique_ptr<KvHeaderWidget> header(model.createHeaderWidget());
    const std::unique_ptr<KvHeaderWidget> otherHeader(model.createHeaderWidget());
    const std::unique_ptr<KvFooterWidget> footer(model.createFooterWidget());
    const std::unique_ptr<KvPageCountWidget> count(model.createPageCountWidget(4));
    QVERIFY(header != otherHeader);
    QCOMPARE(header->toPlainText(), QStringLiteral("top"));
    QCOMPARE(footer->toPlainText(), QStringLiteral("bottom"));
    QCOMPARE(count->text(), QStringLiteral("5"));
    QCOMPARE(header->parentWidget(), &displayParent);
    QCOMPARE(footer->parentWidget(), &displayParent);
    QCOMPARE(count->parentWidget(), &displayParent);
}

void KvTemplateModelTest::forwardsToTheContext()
{
    KvReportKernelData data;
    KvTemplateModel model(nullptr, &data);
    TemplateSignalLog log(&model);
    model.setPageWidth(500);
    QCOMPARE(model.context()->pageWidth(), 500);
    QCOMPARE(log.taken(), QStringList());
    model.beginLiveUpdates();
    model.beginLiveUpdates();
    model.endLiveUpdates();
    QVERIFY(data.isActive());
    model.endLiveUpdates();
    QVERIFY(!data.isActive());
    QCOMPARE(log.taken(), QStringList());
}

void KvTemplateModelTest::messagesGoToTheInstalledObject()
{
    FakeReport report;
    NotedMessages messages;
    report.model()->setUserMessages(&messages);
    const MessageBoxAnswerer answerer;
    const QString missing = temporaryPath(QStringLiteral("missing.rtp"));
    const QString broken = writeFile(QStringLiteral("broken.rtp"), "");
    const QString nowhere = temporaryPath(QStringLiteral("none/file.rtp"));
    QVERIFY(!report.model()->load(missing));
    QVERIFY(!report.model()->load(broken));
    QVERIFY(!report.model()->load(writeFile(QStringLiteral("array.rtp"), "[]")));
    QVERIFY(!report.model()->save(nowhere));
    using Message = QPair<QString, QString>;
    const QVector<Message> expected{
        Message(QStringLiteral("Cannot read"), QStringLiteral("Cannot open file ") + missing),
        Message(QStringLiteral("Error reading file"), QStringLiteral("Cannot read file ") + broken),
        Message(QStringLiteral("Cannot save"), QStringLiteral("Cannot create file ") + nowhere)};
    QCOMPARE(messages.noted(), expected);
    QCOMPARE(answerer.boxes().size(), 0);

    {
        const RightToLeft arabic;
        QVERIFY(!report.model()->load(missing));
        QCOMPARE(messages.noted().last().second,
                 QStringLiteral("Cannot open file ") + RightToLeft::isolated(missing));
    }

    report.model()->setUserMessages(nullptr);
    QVERIFY(!report.model()->load(missing));
    QCOMPARE(messages.noted().size(), 4);
    QCOMPARE(answerer.boxes().size(), 1);
}

void KvTemplateModelTest::messageTextsAreNoMarkup()
{
    // A file may be called "<b>".
    Qt::TextFormat format = Qt::AutoText;
    QTimer timer;
    connect(&timer, &QTimer::timeout, this, [&format]() {
        if (auto *box = qobject_cast<QMessageBox *>(QApplication::activeModalWidget())) {
            format = box->textFormat();
            box->accept();
        }
    });
    timer.start(5);
    KvMessageBoxes boxes;
    boxes.warn(QStringLiteral("Title"), QStringLiteral("Cannot open file <b>"));
    QCOMPARE(format, Qt::PlainText);
}

STATREPORT_TEST_MAIN(KvTemplateModelTest)
#include "KvTemplateModelTest.moc"
