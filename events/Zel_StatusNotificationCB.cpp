#include "Zel_StatusNotificationCB.h"

Zel_StatusNotificationCB::Zel_StatusNotificationCB()
    : Orv_ResultsCB(Orv_RequestID(Orv_RequestID::Callback))
{
}

Zel_StatusNotificationCB::Zel_StatusNotificationCB(const Zel_StatusNotificationCB& other) = default;

Zel_StatusNotificationCB::~Zel_StatusNotificationCB() = default;
