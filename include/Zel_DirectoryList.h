// Zel_DirectoryList: a list of shared directories.
//
// A QList of boost::shared_ptr<Zel_Directory>; copies share the directories.
#ifndef ZEL_DIRECTORYLIST_H
#define ZEL_DIRECTORYLIST_H

#include "zel_export.h"
#include "Zel_Directory.h"

#include <QList>
#include <boost/shared_ptr.hpp>

class ZEL_EXPORT Zel_DirectoryList : public QList<boost::shared_ptr<Zel_Directory>>
{
public:
    Zel_DirectoryList();
    Zel_DirectoryList(const Zel_DirectoryList& other);
    Zel_DirectoryList& operator=(const Zel_DirectoryList& other);
    virtual ~Zel_DirectoryList();
};

#endif
