#include "Zel_AssociationsRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_AssociationsRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Directory> directory,
                                            boost::shared_ptr<Zel_Error> error)
    : mDirectory(std::move(directory))
    , mError(std::move(error))
{
}

Zel_AssociationsRes::ResultItem::~ResultItem() = default;

Zel_AssociationsRes::Zel_AssociationsRes(boost::shared_ptr<Zel_AssociationsCB> callback,
                                         bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCursor(0)
    , mCallback(std::move(callback))
{
}

Zel_AssociationsRes::Zel_AssociationsRes(const Zel_AssociationsRes& other) = default;
Zel_AssociationsRes& Zel_AssociationsRes::operator=(const Zel_AssociationsRes& other) = default;
Zel_AssociationsRes::~Zel_AssociationsRes() = default;

void Zel_AssociationsRes::setResult(boost::shared_ptr<Zel_Directory> directory,
                                    boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(directory), ZelResults::errorRecord(std::move(error)));
}

void Zel_AssociationsRes::callSucceeded(Zel_AssociationsCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mDirectory);
}
