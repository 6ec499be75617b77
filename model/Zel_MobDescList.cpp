#include "Zel_MobDescList.h"

Zel_MobDescList::Zel_MobDescList() = default;
Zel_MobDescList::Zel_MobDescList(const Zel_MobDescList& other) = default;

Zel_MobDescList& Zel_MobDescList::operator=(const Zel_MobDescList& other)
{
    if (this != &other)
        mMobDescs = other.mMobDescs;
    return *this;
}

Zel_MobDescList::~Zel_MobDescList() = default;

void Zel_MobDescList::add(const Zel_MobDesc& desc)
{
    mMobDescs.push_back(boost::shared_ptr<Zel_MobDesc>(new Zel_MobDesc(desc)));
}

void Zel_MobDescList::add(boost::shared_ptr<Zel_MobDesc> desc)
{
    mMobDescs.push_back(std::move(desc));
}

unsigned int Zel_MobDescList::size() const
{
    return static_cast<unsigned int>(mMobDescs.size());
}

boost::shared_ptr<Zel_MobDesc> Zel_MobDescList::getMobDesc(unsigned long long index) const
{
    if (index >= mMobDescs.size())
        return boost::shared_ptr<Zel_MobDesc>();
    return mMobDescs[static_cast<std::size_t>(index)];
}
