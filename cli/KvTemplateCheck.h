// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFault.h"

#include <QCoreApplication>
#include <QStringList>

class KvBlockRegistry;
class QJsonArray;
class QJsonObject;
class QJsonValue;

/** Looks through a template file before it is loaded, and says where in it what is wrong. */
class KvTemplateCheck
{
    Q_DECLARE_TR_FUNCTIONS(KvTemplateCheck)

public:
    explicit KvTemplateCheck(const KvBlockRegistry &blocks);

    /** Reads the file \a path, called \a displayName in faults. False when the template could not be used at
     * all. */
    bool run(const QString &path, const QString &displayName);

    const ZtFault &fault() const { return m_fault; }
    /** What the template holds, a line each. */
    const QStringList &contents() const { return m_contents; }
    /** What would be skipped or read otherwise than it may have been meant, a line each with its place. */
    const QStringList &warnings() const { return m_warnings; }

private:
    bool readRoot(const QString &path, QJsonObject &root);
    bool fail(const QString &place, const QString &message);
    void warn(const QString &place, const QString &message);
    void checkPage(const QJsonValue &config);
    void checkSection(const QString &key, const QJsonValue &section);
    bool checkNodes(const QJsonValue &nodes);
    bool checkNode(const QString &place, const QJsonValue &node);
    bool checkConfig(const QString &place, const QString &typeName, const QJsonValue &config);
    void checkKeywords(const QString &place, const QString &text);

    const KvBlockRegistry &m_blocks;
    ZtFault m_fault;
    QStringList m_contents;
    QStringList m_warnings;
};
