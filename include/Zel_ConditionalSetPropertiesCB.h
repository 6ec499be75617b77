// Zel_ConditionalSetPropertiesCB: the callback of a conditional property
// update (Zel_SetPropertiesReq). The properties of a node are set only where
// the node's current values still match the values the application expected.
// It has the three handlers of Zel_SetPropertiesCB and a fourth,
// conditionFailed, for a node whose current values did not match; that node is
// left unchanged.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_CONDITIONALSETPROPERTIESCB_H
#define ZEL_CONDITIONALSETPROPERTIESCB_H

#include "zel_export.h"
#include "Zel_PropertyList.h"
#include "Zel_SetPropertiesCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Node;

class ZEL_EXPORT Zel_ConditionalSetPropertiesCB : public Zel_SetPropertiesCB
{
public:
    Zel_ConditionalSetPropertiesCB();
    Zel_ConditionalSetPropertiesCB(const Zel_ConditionalSetPropertiesCB& other);
    virtual ~Zel_ConditionalSetPropertiesCB();

    // A node left unchanged because its values did not match: the node and
    // its current values of the compared properties.
    virtual void conditionFailed(boost::shared_ptr<Zel_Node> node, Zel_PropertyList currentValues) = 0;

private:
    Zel_ConditionalSetPropertiesCB& operator=(const Zel_ConditionalSetPropertiesCB&) = delete;
};

#endif
