// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskFileCommands.h"
#include "KvDeskMainWindow.h"
#include "KvDeskPlugins.h"
#include "KvDeskResources.h"
#include "KvDeskTheme.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QComboBox>
#include <QGraphicsProxyWidget>
#include <QGraphicsView>
#include <QLabel>
#include <QLayout>
#include <QPushButton>
#include <QTextEdit>
#include <QToolButton>
#include <QtTest>

#include <algorithm>
#include <memory>

/**
 * The Measuring Desk with the built plug-in in it, as main() puts them together, and a look at their windows.
 *
 * The plug-in's classes are its own; they are known here by name only.
 */
class RunningDesk
{
public:
    RunningDesk()
    {
        KvDeskResources::ensure();
        KvDeskTheme::apply(KvDeskTheme::stored());
        m_document = std::make_unique<ZtMeasuringDocument>();
        m_window = std::make_unique<KvDeskMainWindow>(m_document.get());
        m_plugins = std::make_unique<KvDeskPlugins>(m_window.get());
        m_plugins->load({QStringLiteral(STATREPORT_PLUGIN_FOLDER)});
        m_window->restoreTools();
        m_window->show();
    }
    ~RunningDesk()
    {
        m_plugins.reset();
        m_window.reset();
    }

    ZtMeasuringDocument *document() const { return m_document.get(); }
    KvDeskMainWindow *window() const { return m_window.get(); }
    int pluginCount() const { return m_plugins->count(); }
    /** Ends the plug-ins while the rest goes on. */
    void deletePlugins() { m_plugins.reset(); }

    // The tool panel.
    QToolButton *button(const char *name) const
    {
        return m_window->findChild<QToolButton *>(QLatin1String(name));
    }
    QComboBox *templates() const
    {
        return m_window->findChild<QComboBox *>(QStringLiteral("theTemplatePath"));
    }
    KvToolBase *tool() const { return m_window->tools().value(0); }

    // The editor; null as long as there is none.
    QWidget *editor() const { return topLevel("KvReportTemplatesEditor"); }
    /** Waits for the editor and puts it beside a main window of 860 pixels, as both have to be used; false
     * when it does not come. */
    bool placeEditor() const
    {
        if (!QTest::qWaitFor([this]() { return editor() && editor()->isVisible(); }) ||
            !QTest::qWaitForWindowExposed(editor()))
            return false;
        editor()->move(860, 0);
        editor()->resize(740, 900);
        return true;
    }
    QWidget *statisticsWindow() const { return topLevel("KvStatisticsWindow"); }
    QPushButton *editorButton(const char *name) const
    {
        return editor()->findChild<QPushButton *>(QLatin1String(name));
    }
    QGraphicsView *pages() const
    {
        for (QGraphicsView *view : editor()->findChildren<QGraphicsView *>()) {
            if (view->inherits("KvReportPagedView"))
                return view;
        }
        return nullptr;
    }
    /** Rows of the palette, from top to bottom. */
    QList<QWidget *> palette() const { return childrenOf(editor(), "KvEditorToolWidget"); }
    /** The group of statistics blocks below the others; its header is at its top. */
    QWidget *paletteGroup() const { return childrenOf(editor(), "KvEditorToolCombo").value(0); }
    /** The options panel of what is selected; null when there is none. */
    QWidget *options() const
    {
        auto *frame = editor()->findChild<QWidget *>(QStringLiteral("nodeOptionsFrame"));
        return frame->findChild<QWidget *>(QString(), Qt::FindDirectChildrenOnly);
    }

    /** The items of the blocks' pieces, from top to bottom. */
    QVector<QGraphicsProxyWidget *> pieces() const
    {
        QVector<QGraphicsProxyWidget *> found;
        for (QGraphicsItem *item : pages()->scene()->items()) {
            auto *proxy = qgraphicsitem_cast<QGraphicsProxyWidget *>(item);
            if (proxy && proxy->widget() && proxy->widget()->inherits("KvNodeWrapperWidget"))
                found.append(proxy);
        }
        std::sort(
            found.begin(), found.end(),
            [](const QGraphicsProxyWidget *a, const QGraphicsProxyWidget *b) { return a->y() < b->y(); });
        return found;
    }
    /** Class names of what stands on the pages. */
    QStringList pieceClasses() const
    {
        QStringList names;
        for (const QGraphicsProxyWidget *item : pieces()) {
            QLayoutItem *content =
                item->widget()->findChild<QLayout *>(QStringLiteral("contentVerticalLayout"))->itemAt(0);
            names.append(QString::fromLatin1(content->widget()->metaObject()->className()));
        }
        return names;
    }
    QPointF centerOf(const QGraphicsProxyWidget *item) const
    {
        return item->scenePos() + QRectF(QPointF(), item->size()).center();
    }
    static QTextEdit *textIn(const QGraphicsProxyWidget *item)
    {
        return item->widget()->findChild<QTextEdit *>();
    }

private:
    static QWidget *topLevel(const char *className)
    {
        for (QWidget *widget : QApplication::topLevelWidgets()) {
            if (widget->inherits(className))
                return widget;
        }
        return nullptr;
    }
    static QList<QWidget *> childrenOf(QWidget *parent, const char *className)
    {
        QList<QWidget *> found;
        for (QWidget *widget : parent->findChildren<QWidget *>()) {
            if (widget->inherits(className))
                found.append(widget);
        }
        return found;
    }

    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskMainWindow> m_window;
    std::unique_ptr<KvDeskPlugins> m_plugins;
};
