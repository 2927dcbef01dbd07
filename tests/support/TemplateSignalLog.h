// SPDX-License-Identifier: MIT
#pragma once

#include "report/KvReportNode.h"
#include "templates/KvTemplateModel.h"

#include <QFileInfo>
#include <QStringList>

/** Everything that a template model says, in one list of texts. */
class TemplateSignalLog
{
public:
    explicit TemplateSignalLog(KvTemplateModel *model)
        : m_model(model)
    {
        using M = KvTemplateModel;
        const auto connectTo = [this, model](auto signal, auto slot) {
            QObject::connect(model, signal, &m_receiver, slot);
        };
        connectTo(&M::signalTemplateStatusChanged, [this](const QString &path, bool modified) {
            add(QStringLiteral("status '%1'%2").arg(QFileInfo(path).fileName(), yes(modified, " modified")));
        });
        connectTo(&M::signalCloseAllEditors, [this]() { add(QStringLiteral("close editors")); });
        connectTo(&M::signalListChanged,
                  [this]() { add(QStringLiteral("list %1").arg(m_model->nodeCount())); });
        connectTo(&M::signalBeforeDeleteNode,
                  [this](KvReportNode *node) { add(QStringLiteral("delete ") + node->typeName()); });
        connectTo(&M::signalHeaderStateChanged,
                  [this](bool on) { add(QStringLiteral("header") + yes(on, " on")); });
        connectTo(&M::signalFooterStateChanged,
                  [this](bool on) { add(QStringLiteral("footer") + yes(on, " on")); });
        connectTo(&M::signalPageNumberingStateChanged,
                  [this](bool on) { add(QStringLiteral("numbering") + yes(on, " on")); });
    }

    /** What was said since the last call. */
    QStringList taken()
    {
        const QStringList result = m_seen;
        m_seen.clear();
        return result;
    }
    void add(const QString &entry) { m_seen.append(entry); }

private:
    static QString yes(bool is, const char *text) { return is ? QString::fromLatin1(text) : QString(); }

    KvTemplateModel *m_model;
    QObject m_receiver;
    QStringList m_seen;
};
