// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>

class KvTemplateContext;
class QJsonObject;

/** What the user set for one block, and its "config" object in template files. Lives as long as its report
 * node. */
class KvBaseEditorNodeCfg : public QObject
{
    Q_OBJECT
public:
    explicit KvBaseEditorNodeCfg(KvTemplateContext *context, QObject *parent = nullptr);

    /** Writes the settings as members of \a config. */
    virtual bool toJson(QJsonObject &config) const = 0;
    /** Reads the settings; false rejects the block, which stops the load of the whole template. */
    virtual bool fromJson(const QJsonObject &config) = 0;

    /** The context of the template that the block belongs to, not owned; null in a window without pages. */
    KvTemplateContext *context() const { return m_context; }

private:
    KvTemplateContext *m_context;
};
