// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvBlockRegistry.h"

#include <QFrame>

class KvEditorToolCombo;
class QVBoxLayout;

/**
 * The editor's palette: shows the block types that are registered with it, those of a group in a collapsible
 * KvEditorToolCombo. Template models look block types up in it.
 */
class KvEditorToolsList
    : public QFrame
    , public KvBlockRegistry
{
    Q_OBJECT
public:
    explicit KvEditorToolsList(QWidget *parent = nullptr);
    ~KvEditorToolsList() override;

    void registerFactory(std::unique_ptr<KvBaseEditorNodeFactory> factory,
                         const KvBlockGroup &group = KvBlockGroup()) override;
    KvBaseEditorNodeFactory *find(const QString &name) const override;
    QVector<KvBlockType> blockTypes() const override;

signals:
    /** The user wants a new block of this type without dragging it to a place. */
    void signalToolActivated(const QString &aTypeName);

private:
    KvEditorToolCombo *groupOf(const KvBlockGroup &group);

    KvBlockTypeList m_types;
    QVector<KvEditorToolCombo *> m_groups;
    QVBoxLayout *m_column;
};
