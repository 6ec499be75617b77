# Sources of events, listeners, the event hub and the session base.
set(ZEL_EVENTS_SOURCES
  Zel_ConnectionListener.cpp
  Zel_Event.cpp
  Zel_EventCB.cpp
  Zel_EventListener.cpp
  Zel_EventListenerFolder.cpp
  Zel_EventListenerFolderImpl_p.h
  Zel_EventListenerSPList.cpp
  Zel_EventRes.cpp
  Zel_IEventListenerFolder.cpp
  Zel_NodeListener.cpp
  Zel_Session.cpp
  Zel_StatusNotificationCB.cpp
  Zel_StatusNotificationRes.cpp
)
