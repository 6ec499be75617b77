// Test and benchmark support: a session whose backend operations do nothing, so that the
// shared part of Zel_Session (hub, registration, flags, name rules) can be tested.
#ifndef ZEL_TESTS_STUBSESSION_H
#define ZEL_TESTS_STUBSESSION_H

#include "Zel_Session.h"

#include <QDateTime>
#include <QString>
#include <QStringList>
#include <boost/shared_ptr.hpp>

class StubSession : public Zel_Session
{
public:
    explicit StubSession(const Zel_ResolutionIDList& ids = Zel_ResolutionIDList())
        : Zel_Session(ids)
    {
    }

    // The protected parts, for tests and node listeners.
    using Zel_Session::getEventCBSP;
    using Zel_Session::isValidName;
    using Zel_Session::setConnectedStatus;
    using Zel_Session::getBackendDataSP;
    using Zel_Session::setBackendDataSP;

    QString getServerName() const override { return QString(); }
    QString getServerVersion() const override { return QString(); }
    QString getWorkgroupName() const override { return QString(); }
    QString getUserName() const override { return QString(); }
    QString getApplicationName() const override { return QString(); }
    QString getSessionID() const override { return QString(); }
    bool isLoggedIn() const override { return false; }
    QDateTime getLoginTime() const override { return QDateTime(); }
    void logout() override {}
    MonikerSP getRootMonikerSP() const override { return MonikerSP(); }
    MonikerSP getHomeMonikerSP() const override { return MonikerSP(); }
    QString getPathSeparator() const override { return QString(); }
    bool isValidMoniker(const QString& moniker) const override { return false; }
    boost::shared_ptr<Orv_ResultQ> getResultQSP() const override { return boost::shared_ptr<Orv_ResultQ>(); }
    bool submitRequest(boost::shared_ptr<Orv_Request> request) override { return false; }
    void cancelAllRequests() override {}
    bool supportsRequest(const QString& requestName) const override { return false; }
    QDateTime getServerTime() const override { return QDateTime(); }
    bool isReadOnly() const override { return false; }
    int getMaxNameLength() const override { return 0; }
    void setStatusNotificationCB(boost::shared_ptr<Zel_StatusNotificationCB> callback) override {}
    boost::shared_ptr<Zel_StatusNotificationCB> getStatusNotificationCBSP() const override { return boost::shared_ptr<Zel_StatusNotificationCB>(); }
    // Every request factory answers an empty pointer.
#define ZEL_REQUEST(Stem, Base, Name, Params, ArgNames) \
    boost::shared_ptr<Zel_##Stem##Req> make##Stem##ReqSP Params override { return boost::shared_ptr<Zel_##Stem##Req>(); }
#include "zel_requests.def"
#undef ZEL_REQUEST
    void close() override {}
};

#endif
