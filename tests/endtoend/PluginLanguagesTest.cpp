// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "LanguageWalk.h"

/** Walks through the windows of the plug-in, in every language: editor, options of blocks, statistics. */
class PluginLanguagesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void everyPanelOfTheEditorHasRoom_data() { LanguageWalk::addLanguages(); }
    void everyPanelOfTheEditorHasRoom();
    void everyStatisticsViewHasRoom_data() { LanguageWalk::addLanguages(); }
    void everyStatisticsViewHasRoom();

private:
    void lookAtOptions();

    LanguageWalk m_walk;
};

void PluginLanguagesTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
}

void PluginLanguagesTest::cleanup()
{
    m_walk.end();
    StatReportTest::cleanup();
}

/// Of the selected block, with the dialogs that they open.
void PluginLanguagesTest::lookAtOptions()
{
    QWidget *const options = m_walk.desk()->options();
    m_walk.lookAtSizes(m_walk.desk()->editor(), QLatin1String(options->metaObject()->className()));
    if (!options->inherits("KvTextDocumentNodeOptionsWidget"))
        return;
    for (const char *slot : {"slotLinkClicked", "slotGalleryClicked"})
        m_walk.lookAtModal(QLatin1String(slot), [this, slot]() {
            QVERIFY(QMetaObject::invokeMethod(m_walk.desk()->options(), slot));
        });
}

/// Empty, then with every block and the options of each.
void PluginLanguagesTest::everyPanelOfTheEditorHasRoom()
{
    QFETCH(QString, language);
    m_walk.start(language);
    m_walk.openSession();
    m_walk.openEditor();
    m_walk.lookAtSizes(m_walk.desk()->editor(), QStringLiteral("empty editor"));
    m_walk.composeAll([this]() { lookAtOptions(); });
    QVERIFY2(m_walk.faults().isEmpty(), m_walk.faults());
}

/// Each with its options, which stand beside it.
void PluginLanguagesTest::everyStatisticsViewHasRoom()
{
    QFETCH(QString, language);
    m_walk.start(language);
    m_walk.openSession();
    m_walk.openStatistics();
    QWidget *const window = m_walk.desk()->statisticsWindow();
    m_walk.look(window, QStringLiteral("no view"));
    int views = 0;
    for (auto *button : window->findChildren<QAbstractButton *>()) {
        if (!button->inherits("KvStatisticsToolIconButton"))
            continue;
        button->click();
        m_walk.lookAtSizes(window, button->toolTip());
        ++views;
    }
    QCOMPARE(views, 4);
    QVERIFY2(m_walk.faults().isEmpty(), m_walk.faults());
}

STATREPORT_TEST_MAIN(PluginLanguagesTest)
#include "PluginLanguagesTest.moc"
