#include "Zel_MobAttrList.h"

#include <utility>

Zel_MobAttrList::Zel_MobAttrList() = default;
Zel_MobAttrList::Zel_MobAttrList(const Zel_MobAttrList& other) = default;

Zel_MobAttrList& Zel_MobAttrList::operator=(const Zel_MobAttrList& other)
{
    // Replaces the entries (shared with the other list); appending them after
    // this list's own would keep stale changes and grow on every assignment.
    if (this != &other)
        mMobAttrs = other.mMobAttrs;
    return *this;
}

Zel_MobAttrList::~Zel_MobAttrList() = default;

void Zel_MobAttrList::add(const Zel_MobID& mobID,
                          boost::shared_ptr<Zel_Node> node,
                          const QString& mobName,
                          const QString& attrKey,
                          const QString& oldVal,
                          const QString& newVal)
{
    mMobAttrs.push_back(boost::shared_ptr<Zel_MobAttr>(
        new Zel_MobAttr(mobID, std::move(node), mobName, attrKey, oldVal, newVal, Zel_MobAttr::AttrTypeDefault)));
}

unsigned int Zel_MobAttrList::size() const
{
    return static_cast<unsigned int>(mMobAttrs.size());
}

boost::shared_ptr<Zel_MobAttr> Zel_MobAttrList::getMobAttr(unsigned long long index) const
{
    if (index >= mMobAttrs.size())
        return boost::shared_ptr<Zel_MobAttr>();
    return mMobAttrs[static_cast<std::size_t>(index)];
}
