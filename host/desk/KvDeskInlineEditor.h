// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectId.h"

#include <QLineEdit>
#include <QPointF>

class KvDeskImageView;

/**
 * A small field on the image in which a name or a text is written where it will stand. Enter or going
 * elsewhere takes what is written, Escape leaves everything as it was.
 */
class KvDeskInlineEditor : public QLineEdit
{
    Q_OBJECT
public:
    explicit KvDeskInlineEditor(KvDeskImageView *view);

    /** The text of a text note, the name of another object. */
    void edit(const KvDeskObjectId &object);
    void rename(const KvDeskObjectId &object);
    /** A new text note at a point of the image; without a text there will be none. */
    void writeNote(const QPointF &place);

    bool isEditing() const { return m_purpose != Nothing; }

public slots:
    void slotAccept();
    void slotCancel();

signals:
    void signalEditingChanged(); ///< isEditing()

protected:
    void keyPressEvent(QKeyEvent *event) override;
    void focusOutEvent(QFocusEvent *event) override;

private:
    enum Purpose { Nothing, Rename, ChangeText, WriteNote };

    void start(Purpose purpose, const QPointF &place, const QString &text, const QString &label);
    void finish();

    KvDeskImageView *m_view;
    Purpose m_purpose = Nothing;
    KvDeskObjectId m_object;
    QPointF m_place;
};
