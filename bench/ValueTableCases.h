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
    /** Nothing yet. */
    ValueTableCases();

    int rowCount() const;
    /** Hands an imported table of so many objects, with three values each, to the document; the table of
     * values does not show it yet. */
    void import(int objects);
    /** Shows what came or went; the time until then is what somebody waits for. */
    void follow();
    void clear();
    /** Removes one imported object. */
    void removeImported();
    /** What autosaving takes of the document. */
    void takeSession();
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
    void create();
    int nextLine();

    ZtMeasuringDocument m_document;
    KvDeskSession m_session;
    KvDeskSelection m_selection;
    KvDeskObjectEditor m_editor;
    KvDeskValueTable m_table;
    int m_lines = 0;
    int m_step = 0;
    int m_added = 0;
    int m_removed = 0;
};
