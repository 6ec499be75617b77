#include "Zel_EventListenerSPList.h"

#include "Zel_EventListener.h"

Zel_EventListenerSPList::Zel_EventListenerSPList() = default;
Zel_EventListenerSPList::Zel_EventListenerSPList(const Zel_EventListenerSPList& other) = default;
Zel_EventListenerSPList& Zel_EventListenerSPList::operator=(const Zel_EventListenerSPList& other) = default;
Zel_EventListenerSPList::~Zel_EventListenerSPList() = default;
