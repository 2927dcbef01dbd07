// SPDX-License-Identifier: MIT
#include "report/KvReportNode.h"

#include "report/KvBaseDisplayWidget.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvBaseEditorNodeCfg.h"
#include "templates/KvBaseEditorNodeFactory.h"

#include <QDataStream>
#include <QJsonArray>
#include <QJsonObject>
#include <QMimeData>

#include <utility>

const char KvReportNode::MimeFormat[] = "application/x-meeditorpreviewlistmodeldatalist";

KvReportNode::KvReportNode(QWidget *displayParent, KvBaseEditorNodeFactory *factory,
                           KvTemplateContext *context, KvTemplateModel *model)
    : m_model(model)
    , m_factory(factory)
    , m_displayParent(displayParent)
    , m_context(context)
    , m_config(factory->createConfig(context))
{}

KvReportNode::~KvReportNode()
{
    resetDisplayWidget();
}

QString KvReportNode::typeName() const
{
    return m_factory->name();
}

KvBaseDisplayWidget *KvReportNode::displayWidget()
{
    if (!m_displayWidget) {
        m_displayWidget = m_factory->createDisplayWidget(m_displayParent, m_config.get());
        if (m_displayWidget)
            connect(m_displayWidget->displaySignals(), SIGNAL(destroyed()), this,
                                                              SLOT(slotDisplayWidgetDestroyed()));
    }
    return m_displayWidget;
}

void KvReportNode::resetDisplayWidget()
{
    if (!m_displayWidget)
        return;
    m_displayWidget->displaySignals()->disconnect(this);
    delete std::exchange(m_displayWidget, nullptr);
}

void KvReportNode::slotDisplayWidgetDestroyed()
{
    m_displayWidget = nullptr;
}

bool KvReportNode::toJson(QJsonArray &nodes) const
{
    QJsonObject config;
    if (!m_config->toJson(config))
        return false;
    nodes.append(QJsonObject{{QStringLiteral("name"), typeName()}, {QStringLiteral("config"), config}});
    return true;
}

QMimeData *KvReportNode::mimeData(int index) const
{
    QByteArray bytes;
    QDataStream stream(&bytes, QIODevice::WriteOnly);
    stream << QStringLiteral("nodeIndex") << static_cast<qint32>(index);
    auto *data = new QMimeData;
    data->setData(QLatin1String(MimeFormat), bytes);
    return data;
}
