// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectState.h"

#include <QObject>
#include <QSet>

#include <vector>

class KvDeskSelection;
class KvDeskSession;
class QUndoCommand;
class QUndoStack;
class ZtCalibration;
class ZtKernelObjectData;
class ZtReadyObjects;

/**
 * Every change that the user makes to objects: each is one step that can be undone and redone, and objects
 * keep their ids over both. Undoing or redoing selects what it changed.
 *
 * The history ends with the session: it is emptied when another one is opened. Objects that come or go by
 * other ways than this editor end it, too, as steps might then meet other objects. What cannot be done, such
 * as changing an object that is not there, is no step.
 */
class KvDeskObjectEditor : public QObject
{
    Q_OBJECT
public:
    static constexpr int maximumSteps = 1000;
    static constexpr double standardPasteOffset = 10.0; ///< image pixels

    /** Both have to outlive the editor. */
    KvDeskObjectEditor(KvDeskSession *session, KvDeskSelection *selection, QObject *parent = nullptr);
    ~KvDeskObjectEditor() override;

    QUndoStack *undoStack() const { return m_stack; }
    KvDeskSelection *selection() const { return m_selection; }

    /** Draws an object and selects it; null when the type does not take the points. */
    KvDeskObjectId create(int typeId, const QPolygonF &points, const QString &name = QString(),
                          const QString &text = QString());
    /** Steps on the same object become one until slotFinishGesture(). */
    void setPoints(KvDeskObjectId object, const QPolygonF &points);
    /** Moves by image pixels. Moves of the same objects become one step until slotFinishGesture(). */
    void moveBy(const QSet<KvDeskObjectId> &objects, const QPointF &offset);
    /** An empty name gives the object back the one it has by itself. */
    void rename(KvDeskObjectId object, const QString &name);
    void setText(KvDeskObjectId object, const QString &text);
    /** \a position is that of the value among the names of its type's values. */
    void setValueShown(KvDeskObjectId object, int position, bool isShown);
    void remove(const QSet<KvDeskObjectId> &objects);
    /** Measures with another calibration. */
    void setCalibration(const ZtCalibration &calibration);
    void addPlace(KvDeskObjectId counter, const QPointF &place);
    /** \a index is that of the place among the counter's points. */
    void removePlace(KvDeskObjectId counter, int index);

    /** Adds the objects of a table that was read already; \a name is what the user calls the table. A table
     * without objects is no step. */
    void importTable(const QString &name, std::vector<ZtReadyObjects> objects);

    /** Objects that were drawn go to the clipboard, and the values of all of them as a table. */
    void copy(const QSet<KvDeskObjectId> &objects);
    void cut(const QSet<KvDeskObjectId> &objects);
    bool canPaste() const;
    /** Adds and selects the objects of the clipboard, each time \a offset (image pixels) further. */
    QSet<KvDeskObjectId> paste(const QPointF &offset);
    QSet<KvDeskObjectId> paste() { return paste(QPointF(standardPasteOffset, standardPasteOffset)); }

    /** The name by which the user knows what is changed: of one object its own, else how many they are. */
    static QString describe(const QSet<KvDeskObjectId> &objects);

public slots:
    void slotUndo();
    void slotRedo();
    /** The next move or change of points is a step of its own; so it is when another object gets selected. */
    void slotFinishGesture();

signals:
    void signalCalibrationRestored(); ///< by undo or redo

private slots:
    void slotSessionReplaced();
    void slotSessionStateChanged();
    void slotCleanChanged(bool aIsClean);
    void slotOtherChange();
    void slotObjectCreated(int aType, int aId, const ZtKernelObjectData *aObject);
    void slotObjectChanged(int aType, int aId, const ZtKernelObjectData *aObject);
    void slotObjectRemoved(int aType, int aId);

private:
    void connectSignals();
    void push(QUndoCommand *command);
    /** One step that makes the objects what \a after says; none when they are so already. */
    void change(const QString &text, const QVector<KvDeskObjectState> &after, int gesture = 0);
    void objectCameOrWent(int type);
    void selectTouched();
    void walkHistory(void (QUndoStack::*way)());

    KvDeskSession *m_session;
    KvDeskSelection *m_selection;
    QUndoStack *m_stack;
    QSet<KvDeskObjectId> m_touched; ///< by the step that is being undone or redone
    int m_gesture = 1;
    int m_pasteCount = 0;
    bool m_isApplying = false;
};
