// SPDX-License-Identifier: MIT
#pragma once

#include <QTranslator>

/** Translates every text of one context to itself between angle quotes, so that translated texts are seen. */
class MarkingTranslator : public QTranslator
{
public:
    explicit MarkingTranslator(const QString &context)
        : m_context(context)
    {}

    bool isEmpty() const override { return false; }
    QString translate(const char *context, const char *sourceText, const char *, int) const override
    {
        if (m_context != QLatin1String(context))
            return QString();
        return QStringLiteral("«%1»").arg(QString::fromUtf8(sourceText));
    }

private:
    QString m_context;
};
