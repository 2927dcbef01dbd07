// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectEditor.h"
#include "KvDeskSelection.h"
#include "KvDeskSession.h"
#include "KvDeskValueTable.h"
#include "measuring/ZtMeasuringDocument.h"

/** A shown table of values over many objects that were drawn. */
class ValueTableCases
{
public:
    /** Half of the objects are lines with one value, the others circles with two. */
    explicit ValueTableCases(int objects);

    int rowCount() const;
    /** Makes one line another one, and shows that. */
    void changeOne();
    void addOne();
    void removeOne();
    void selectOne();
    void selectAll();
    /** Scrolls by a page, and shows that. */
    void scroll();
    void sort(int column);
    void filter(const QString &text);
    /** Everything is read again. */
    void reset();
    /** Draws what has to be drawn. */
    void show();

private:
    int nextLine();

    ZtMeasuringDocument m_document;
    KvDeskSession m_session;
    KvDeskSelection m_selection;
    KvDeskObjectEditor m_editor;
    KvDeskValueTable m_table;
    int m_lines;
    int m_step = 0;
    int m_added = 0;
};
