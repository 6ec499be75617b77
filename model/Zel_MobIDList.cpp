#include "Zel_MobIDList.h"

Zel_MobIDList::Zel_MobIDList() = default;
Zel_MobIDList::Zel_MobIDList(const Zel_MobIDList& other) = default;

Zel_MobIDList& Zel_MobIDList::operator=(const Zel_MobIDList& other)
{
    if (this != &other)
        mMobIDs = other.mMobIDs;
    return *this;
}

Zel_MobIDList::~Zel_MobIDList() = default;

void Zel_MobIDList::add(Zel_MobID id)
{
    mMobIDs.push_back(boost::shared_ptr<Zel_MobID>(new Zel_MobID(std::move(id))));
}

void Zel_MobIDList::remove(Zel_MobID id)
{
    for (auto it = mMobIDs.begin(); it != mMobIDs.end(); ++it) {
        if (**it == id) {
            mMobIDs.erase(it);
            return;
        }
    }
}

void Zel_MobIDList::clear()
{
    mMobIDs.clear();
}

unsigned int Zel_MobIDList::size() const
{
    return static_cast<unsigned int>(mMobIDs.size());
}

boost::shared_ptr<Zel_MobID> Zel_MobIDList::getMobID(unsigned long long index) const
{
    if (index >= mMobIDs.size())
        return boost::shared_ptr<Zel_MobID>();
    return mMobIDs[static_cast<std::size_t>(index)];
}
