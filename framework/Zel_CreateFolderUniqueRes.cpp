#include "Zel_CreateFolderUniqueRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_CreateFolderUniqueRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Node> folder,
                                                  boost::shared_ptr<Zel_Error> error)
    : mNode(std::move(folder))
    , mError(std::move(error))
{
}

Zel_CreateFolderUniqueRes::ResultItem::~ResultItem() = default;

Zel_CreateFolderUniqueRes::Zel_CreateFolderUniqueRes(boost::shared_ptr<Zel_CreateFolderUniqueCB> callback,
                                                     bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_CreateFolderUniqueRes::Zel_CreateFolderUniqueRes(const Zel_CreateFolderUniqueRes& other) = default;
Zel_CreateFolderUniqueRes& Zel_CreateFolderUniqueRes::operator=(const Zel_CreateFolderUniqueRes& other) = default;
Zel_CreateFolderUniqueRes::~Zel_CreateFolderUniqueRes() = default;

void Zel_CreateFolderUniqueRes::setResult(boost::shared_ptr<Zel_Node> folder,
                                          boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(folder), ZelResults::errorRecord(std::move(error)));
}

void Zel_CreateFolderUniqueRes::callSucceeded(Zel_CreateFolderUniqueCB& callback,
                                              const ResultItem& item)
{
    callback.succeeded(item.mNode);
}
