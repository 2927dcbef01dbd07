// SPDX-License-Identifier: MIT
#include "templates/KvBlockRegistry.h"

#include "templates/KvBaseEditorNodeFactory.h"

KvBlockRegistry::~KvBlockRegistry() = default;

KvBlockTypeList::KvBlockTypeList() = default;
KvBlockTypeList::~KvBlockTypeList() = default;

void KvBlockTypeList::registerFactory(std::unique_ptr<KvBaseEditorNodeFactory> factory,
                                      const KvBlockGroup &group)
{
    if (!factory)
        return;
    m_types.append({factory.get(), group});
    m_factories.push_back(std::move(factory));
}

KvBaseEditorNodeFactory *KvBlockTypeList::find(const QString &name) const
{
    for (const KvBlockType &type : m_types) {
        if (type.factory->name() == name)
            return type.factory;
    }
    return nullptr;
}
