// SPDX-License-Identifier: MIT
#pragma once

#include <QTranslator>

#include <memory>

/**
 * The translation of the program and of Qt's own texts, installed while this lives; also sets the direction
 * of the layout. Texts of a language without a translation file stay English.
 */
class KvDeskTranslation
{
public:
    /** \a language as KvDeskLanguages::effectiveName() gives it. */
    explicit KvDeskTranslation(const QString &language);
    ~KvDeskTranslation();

    bool isLoaded() const { return m_isLoaded; }

private:
    Q_DISABLE_COPY(KvDeskTranslation)

    std::unique_ptr<QTranslator> m_direction;
    QTranslator m_program;
    QTranslator m_qt;
    bool m_isLoaded;
};
