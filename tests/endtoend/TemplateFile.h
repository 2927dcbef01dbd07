// SPDX-License-Identifier: MIT
#pragma once

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QString>

/** Writes files that tests hand to the program. */
namespace TemplateFile {

inline bool write(const QString &path, const QByteArray &bytes)
{
    QFile file(path);
    return file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size();
}

inline QByteArray read(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("cannot be read: ") + path.toUtf8();
}

inline QJsonObject textBlock(const QString &html)
{
    return {{QStringLiteral("name"), QStringLiteral("Text Document")},
            {QStringLiteral("config"), QJsonObject{{QStringLiteral("text"), html}}}};
}

inline QJsonObject tableBlock(const QString &theme = QStringLiteral("Light"))
{
    return {{QStringLiteral("name"), QStringLiteral("Measurement table")},
            {QStringLiteral("config"),
             QJsonObject{{QStringLiteral("theme"), theme}, {QStringLiteral("widthPercent"), 100}}}};
}

inline QJsonObject section(const QString &text, bool isEnabled)
{
    return {{QStringLiteral("text"), text}, {QStringLiteral("enabled"), isEnabled}};
}

/** Page numbers are on; header and footer when they have a text. */
inline QByteArray bytes(const QJsonArray &blocks, const QString &header = QString(),
                        const QString &footer = QString(), int pageWidth = 952)
{
    const QJsonObject root{{QStringLiteral("config"), QJsonObject{{QStringLiteral("pageWidth"), pageWidth},
                                                                  {QStringLiteral("marginWidth"), 0.12}}},
                           {QStringLiteral("header"), section(header, !header.isEmpty())},
                           {QStringLiteral("footer"), section(footer, !footer.isEmpty())},
                           {QStringLiteral("pageNumbering"), section(QString(), true)},
                           {QStringLiteral("nodes"), blocks}};
    return QJsonDocument(root).toJson();
}

} // namespace TemplateFile
