// Zel_NodeList: a list of shared nodes.
//
// A QList of boost::shared_ptr<Zel_Node>; copies share the nodes.
#ifndef ZEL_NODELIST_H
#define ZEL_NODELIST_H

#include "zel_export.h"
#include "Zel_Node.h"

#include <QList>
#include <boost/shared_ptr.hpp>

class ZEL_EXPORT Zel_NodeList : public QList<boost::shared_ptr<Zel_Node>>
{
public:
    Zel_NodeList();
    Zel_NodeList(const Zel_NodeList& other);
    Zel_NodeList& operator=(const Zel_NodeList& other);
    virtual ~Zel_NodeList();
};

#endif
