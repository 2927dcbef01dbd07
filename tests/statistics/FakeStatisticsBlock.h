// SPDX-License-Identifier: MIT
#pragma once

#include "report/KvBaseDisplayWidget.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvBaseEditorNodeCfg.h"
#include "templates/KvBaseEditorNodeFactory.h"

#include <QFrame>
#include <QJsonObject>
#include <QLabel>
#include <QPointer>
#include <QVector>

/** Configuration of a made-up statistics block: a theme, read first, and a number, without which it is
 * refused. */
class FakeStatisticsCfg : public KvBaseEditorNodeCfg
{
public:
    explicit FakeStatisticsCfg(KvTemplateContext *context)
        : KvBaseEditorNodeCfg(context)
    {}

    bool toJson(QJsonObject &config) const override
    {
        config[QStringLiteral("theme")] = theme;
        config[QStringLiteral("number")] = number;
        return true;
    }
    bool fromJson(const QJsonObject &config) override
    {
        theme = config.value(QStringLiteral("theme")).toString(theme);
        number = config.value(QStringLiteral("number")).toInt(number);
        return config.contains(QStringLiteral("number"));
    }

    QString theme = QStringLiteral("Dark");
    int number = 7;
};

/** Display widget of a made-up statistics block. */
class FakeStatisticsDisplay
    : public QLabel
    , public KvBaseDisplayWidget
{
public:
    FakeStatisticsDisplay(QWidget *parent, FakeStatisticsCfg *cfg)
        : QLabel(QStringLiteral("A statistics block"), parent)
        , m_cfg(cfg)
    {
        setAlignment(Qt::AlignCenter);
    }

    QString displayName() const override { return text(); }
    QWidget *subWidgetAt(int index) override { return index == 0 ? this : nullptr; }
    QWidget *createOptionsWidget(QWidget *parent, bool withPlacement) override
    {
        ++m_optionsRequests;
        m_optionsParent = parent;
        m_withPlacement = withPlacement;
        m_options = m_withoutOptions ? nullptr : new QFrame(parent);
        return m_options;
    }

    /** What the options panel does when the user chooses something. */
    void changeNumber(int number)
    {
        m_cfg->number = number;
        emit displaySignals()->signalWidgetConfigChanged(m_cfg);
    }

    FakeStatisticsCfg *cfg() const { return m_cfg; }
    QWidget *options() const { return m_options; }
    int optionsRequests() const { return m_optionsRequests; }
    QWidget *optionsParent() const { return m_optionsParent; }
    bool withPlacement() const { return m_withPlacement; }
    void setWithoutOptions(bool without) { m_withoutOptions = without; }

private:
    FakeStatisticsCfg *m_cfg;
    QPointer<QWidget> m_options;
    int m_optionsRequests = 0;
    QWidget *m_optionsParent = nullptr;
    bool m_withPlacement = true;
    bool m_withoutOptions = false;
};

/** A made-up statistics block type under one of the names that the statistics window knows. */
class FakeStatisticsFactory : public KvBaseEditorNodeFactory
{
public:
    explicit FakeStatisticsFactory(const QString &name)
        : KvBaseEditorNodeFactory(name, name + QStringLiteral(" title"),
                                  QStringLiteral("Icons/ToolIconTable.svg"))
    {}

    KvBaseDisplayWidget *createDisplayWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg) override
    {
        if (m_refusing)
            return nullptr;
        auto *display = new FakeStatisticsDisplay(parent, static_cast<FakeStatisticsCfg *>(cfg));
        display->setWithoutOptions(m_withoutOptions);
        m_displays.append(display);
        return display;
    }
    KvBaseEditorNodeCfg *createConfig(KvTemplateContext *context) override
    {
        ++m_configsMade;
        return new FakeStatisticsCfg(context);
    }

    /** The display widget made last, or null when it is gone. */
    FakeStatisticsDisplay *display() const
    {
        return m_displays.isEmpty() ? nullptr : m_displays.last().data();
    }
    int displaysMade() const { return m_displays.size(); }
    int configsMade() const { return m_configsMade; }
    void setWithoutOptions(bool without) { m_withoutOptions = without; }
    /** From now on there are no display widgets. */
    void setRefusing(bool refusing) { m_refusing = refusing; }

private:
    QVector<QPointer<FakeStatisticsDisplay>> m_displays;
    int m_configsMade = 0;
    bool m_withoutOptions = false;
    bool m_refusing = false;
};
