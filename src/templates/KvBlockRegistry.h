// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QVector>

#include <memory>
#include <vector>

class KvBaseEditorNodeFactory;

/** A titled group of block types in the editor's palette; an empty title means ungrouped. */
struct KvBlockGroup
{
    QString title;
    QString iconPath;
};

/** One registered block type. */
struct KvBlockType
{
    KvBaseEditorNodeFactory *factory = nullptr; ///< owned by the registry
    KvBlockGroup group;
};

/** The block types that a template may hold, in the order in which the palette shows them. */
class KvBlockRegistry
{
public:
    virtual ~KvBlockRegistry();

    virtual void registerFactory(std::unique_ptr<KvBaseEditorNodeFactory> factory,
                                 const KvBlockGroup &group = KvBlockGroup()) = 0;
    /** The factory of exactly this name (case-sensitive), or null. */
    virtual KvBaseEditorNodeFactory *find(const QString &name) const = 0;
    virtual QVector<KvBlockType> blockTypes() const = 0;
};

/** The registry that editor, plug-in and command-line tool use; needs no window. */
class KvBlockTypeList : public KvBlockRegistry
{
public:
    KvBlockTypeList();
    ~KvBlockTypeList() override;

    void registerFactory(std::unique_ptr<KvBaseEditorNodeFactory> factory,
                         const KvBlockGroup &group = KvBlockGroup()) override;
    KvBaseEditorNodeFactory *find(const QString &name) const override;
    QVector<KvBlockType> blockTypes() const override { return m_types; }

private:
    QVector<KvBlockType> m_types;
    std::vector<std::unique_ptr<KvBaseEditorNodeFactory>> m_factories;
};
