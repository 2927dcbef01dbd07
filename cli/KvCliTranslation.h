// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

#include <memory>
#include <vector>

class QTranslator;

/**
 * The translators of a run, for as long as this lives: Qt's where they are installed, and those of the
 * measuring library, of the report blocks and of statreport itself, which are in the program. Needs an
 * application.
 */
class KvCliTranslation
{
public:
    /** \a language by its English name, such as "ChineseSimple". */
    explicit KvCliTranslation(const QString &language);
    ~KvCliTranslation();

private:
    void add(std::unique_ptr<QTranslator> translator);

    std::vector<std::unique_ptr<QTranslator>> m_translators;
};
