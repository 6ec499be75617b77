// Zel_NodeList: a list of shared nodes.
//
// A QList of boost::shared_ptr<Zel_Node>; copies share the nodes.
//
// sortByOrder() puts the nodes in the order of Zel_Node::operator< (mime type
// rank, name without regard to case, exact name, moniker), keeping nodes that
// compare equal in the order they had, exactly as std::stable_sort with
// operator< would. It reads each node's mime type, name and moniker once and
// sorts by those keys, where a sort with operator< reads them again for every
// comparison; prefer it for any list longer than a handful of nodes.
#ifndef ZEL_NODELIST_H
#define ZEL_NODELIST_H

#include "zel_export.h"
#include "Zel_Node.h"

#include <QList>
#include <boost/shared_ptr.hpp>

#include <vector>

class ZEL_EXPORT Zel_NodeList : public QList<boost::shared_ptr<Zel_Node>>
{
public:
    Zel_NodeList();
    Zel_NodeList(const Zel_NodeList& other);
    Zel_NodeList& operator=(const Zel_NodeList& other);
    virtual ~Zel_NodeList();

    // Sorts this list into node order (see above). Null pointers go last, in
    // the order they had.
    void sortByOrder();
    // The same for any list or vector of shared nodes.
    static void sortByOrder(QList<boost::shared_ptr<Zel_Node>>& nodes);
    static void sortByOrder(std::vector<boost::shared_ptr<Zel_Node>>& nodes);
};

#endif
