// SPDX-License-Identifier: MIT
#pragma once

#include "DeskUser.h"
#include "KvDeskActions.h"
#include "KvDeskLanguages.h"
#include "KvDeskLiveBar.h"
#include "KvDeskTranslation.h"
#include "KvDeskValueTable.h"
#include "KvDeskValueTableModel.h"
#include "ModalVisit.h"
#include "RunningDesk.h"
#include "TextFit.h"
#include "host/desk/FakeCamera.h"
#include "kernel/ZtAppSettings.h"


#include <functional>

/** The Measuring Desk with the plug-in in one language, opened window by window to see whether the texts have
 * room. */
class LanguageWalk
{
public:
    /** One row for each language of the Desk. */
    static void addLanguages()
    {
        QTest::addColumn<QString>("language");
        for (const KvDeskLanguage &language : KvDeskLanguages::all())
            QTest::newRow(qPrintable(language.name)) << language.name;
    }

    ~LanguageWalk() { end(); }

    void start(const QString &language)
    {
        m_faults.clear();
        ZtAppSettings::setValue(QStringLiteral("GEN_Language"), language);
        QLocale::setDefault(KvDeskLanguages::localeOf(language));
        m_translation = std::make_unique<KvDeskTranslation>(language);
        QVERIFY(m_translation->isLoaded());
        m_desk = std::make_unique<RunningDesk>();
        window()->resize(1280, 800);
        QVERIFY(QTest::qWaitForWindowExposed(window()));
    }

    void end()
    {
        m_desk.reset();
        m_translation.reset();
        QLocale::setDefault(QLocale::c());
        QGuiApplication::setLayoutDirection(Qt::LeftToRight);
        ZtAppSettings::setValue(QStringLiteral("GEN_Language"), QStringLiteral("English"));
    }

    RunningDesk *desk() const { return m_desk.get(); }
    KvDeskMainWindow *window() const { return m_desk->window(); }
    QAction *action(KvDeskActions::Id id) const { return window()->actions()->action(id); }
    DeskUser *user() { return &m_user; }

    /** What was found so far, for QVERIFY2: empty when every text had room. */
    QByteArray faults() const
    {
        return m_faults.isEmpty() ? QByteArray() : '\n' + m_faults.join(QLatin1Char('\n')).toUtf8();
    }

    void look(QWidget *widget, const QString &name)
    {
        QVERIFY(QTest::qWaitForWindowExposed(widget));
        QTRY_VERIFY(hasShownAll(widget));
        // Layouts take a few rounds of events after a change.
        const bool isSettled =
            QTest::qWaitFor([widget]() { return TextFit::faults(widget).isEmpty(); }, kSettling);
        for (const QAbstractSpinBox *field : widget->findChildren<QAbstractSpinBox *>()) {
            // Numbers are written alike everywhere.
            if (field->locale().language() != QLocale::C)
                m_faults.append(name + QStringLiteral(": a number in another form ") + field->text());
        }
        if (isSettled)
            return;
        for (const QString &fault : TextFit::faults(widget))
            m_faults.append(name + QStringLiteral(": ") + fault);
    }

    /** At its smallest, at the size of a small screen, and at the size of a large one. */
    void lookAtSizes(QWidget *widget, const QString &name)
    {
        const QSize least = widget->minimumSize();
        for (const QSize &wanted : {least, QSize(1024, 700), QSize(1280, 800)}) {
            const QSize size = wanted.expandedTo(least);
            widget->resize(size);
            look(widget, QStringLiteral("%1 at %2x%3").arg(name).arg(size.width()).arg(size.height()));
        }
    }

    /** Does something that runs a modal window, looks at that window, and closes it. */
    void lookAtModal(const QString &name, const std::function<void()> &open)
    {
        QVERIFY2(visitModal(open, [&](QWidget *modal) { look(modal, name); }), qPrintable(name));
    }

    void showAllPanels()
    {
        using A = KvDeskActions;
        for (const A::Id id : {A::ShowValues, A::ShowGallery, A::ShowLog, A::ShowRulers, A::ShowLabels})
            action(id)->setChecked(true);
    }

    void openSession()
    {
        QVERIFY(window()->files()->openSession(
            QStringLiteral(STATREPORT_SOURCE_DIR "/examples/sessions/demo.json")));
        QTRY_VERIFY(window()->valueTable()->model()->rowCount() > 0);
    }

    void showLiveImage()
    {
        auto camera = std::make_unique<FakeCamera>();
        FakeCamera *const live = camera.get();
        m_desk->document()->setFrameSource(std::move(camera));
        live->start();
        live->deliver();
        QTRY_VERIFY(window()->liveBar()->isVisible());
    }

    void openEditor()
    {
        m_desk->button("theEditorButton")->click();
        QTRY_VERIFY(m_desk->editor() && m_desk->editor()->isVisible());
    }

    /** Adds every block of the palette by its key, and gives its piece to \a visit, selected. */
    void composeAll(const std::function<void()> &visit)
    {
        const QList<QWidget *> palette = m_desk->palette();
        QCOMPARE(palette.size(), 8);
        for (QWidget *row : palette) {
            const int before = m_desk->pieces().size();
            row->setFocus();
            QTest::keyClick(row, Qt::Key_Return);
            QTRY_VERIFY(m_desk->pieces().size() > before);
            const QGraphicsProxyWidget *added = m_desk->pieces().at(before);
            m_desk->pages()->centerOn(m_desk->centerOf(added));
            m_user.clickScene(m_desk->pages(), m_desk->centerOf(added));
            QTRY_VERIFY(m_desk->options() && m_desk->options()->isVisible());
            visit();
        }
    }

    void openStatistics()
    {
        m_desk->button("theStatisticsButton")->click();
        QTRY_VERIFY(m_desk->statisticsWindow() && m_desk->statisticsWindow()->isVisible());
    }

private:
    static constexpr int kSettling = 500; // ms

    /// Layouts show what they are given in the next round of events.
    static bool hasShownAll(const QWidget *window)
    {
        for (QWidget *widget : window->findChildren<QWidget *>()) {
            const QWidget *const parent = widget->parentWidget();
            if (parent->isVisible() && parent->layout() && parent->layout()->indexOf(widget) >= 0 &&
                widget->isHidden() && !widget->testAttribute(Qt::WA_WState_ExplicitShowHide))
                return false;
        }
        return true;
    }

    std::unique_ptr<KvDeskTranslation> m_translation;
    std::unique_ptr<RunningDesk> m_desk;
    DeskUser m_user;
    QStringList m_faults;
};
