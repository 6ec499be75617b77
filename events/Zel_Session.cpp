#include "Zel_Session.h"

#include "Zel_EventCB.h"
#include "Zel_EventListener.h"

// Shared by every session that shares one hub (copies of a session). When the
// last of them lets go, the hub is emptied: a hub may outlive its sessions
// (event results and node listeners hold it), but no listener stays in it.
class Zel_Session::HubLease
{
public:
    explicit HubLease(const boost::shared_ptr<Zel_EventCB>& hub)
        : mHub(hub)
    {
    }
    ~HubLease()
    {
        if (mHub)
            mHub->UnregisterAll();
    }

private:
    HubLease(const HubLease&) = delete;
    HubLease& operator=(const HubLease&) = delete;

    boost::shared_ptr<Zel_EventCB> mHub;
};

Zel_Session::Zel_Session(const Zel_ResolutionIDList& resolutionIDs)
    : mID(Orv_RequestID::Session)
    , mConnected(true)
    , mRemoteClient(false)
    , mResolutionIDs(resolutionIDs)
    , mHub(new Zel_EventCB)
    , mHubLease(new HubLease(mHub))
{
}

Zel_Session::Zel_Session(const Zel_Session& other) = default;

Zel_Session& Zel_Session::operator=(const Zel_Session& other) = default;

Zel_Session::~Zel_Session()
{
    // Empties the hub when this was the last session sharing it.
    mHubLease.reset();
}

const QString Zel_Session::illegalAssetNameCharacters() const
{
    return QString();
}

const QString Zel_Session::illegalPropertyNameCharacters() const
{
    return QString();
}

void Zel_Session::RegisterListener(boost::shared_ptr<Zel_EventListener> listener)
{
    if (mHub)
        mHub->Register(std::move(listener));
}

void Zel_Session::UnregisterListener(boost::shared_ptr<Zel_EventListener> listener)
{
    if (mHub)
        mHub->Unregister(std::move(listener));
}

bool Zel_Session::getConnectionStatus() const
{
    return mConnected;
}

bool Zel_Session::getRemoteClientStatus() const
{
    return mRemoteClient;
}

void Zel_Session::setRemoteClientStatus(bool remoteClient)
{
    mRemoteClient = remoteClient;
}

const Zel_ResolutionIDList& Zel_Session::getResolutionIDList() const
{
    return mResolutionIDs;
}

bool Zel_Session::isValidAssetName(const QString& name) const
{
    return isValidName(name, illegalAssetNameCharacters());
}

bool Zel_Session::isValidPropertyName(const QString& name) const
{
    return isValidName(name, illegalPropertyNameCharacters());
}

boost::shared_ptr<Zel_EventCB> Zel_Session::getEventCBSP()
{
    return mHub;
}

void Zel_Session::setConnectedStatus(bool connected)
{
    mConnected = connected;
}

bool Zel_Session::isValidName(const QString& name, const QString& illegalCharacters) const
{
    // A word character as Qt's regular expressions define \w: a letter, a
    // digit (any number category), a mark, or the underscore.
    bool hasWordCharacter = false;
    for (const QChar c : name) {
        if (c.isLetterOrNumber() || c.isMark() || c == QLatin1Char('_')) {
            hasWordCharacter = true;
            break;
        }
    }
    if (!hasWordCharacter)
        return false;

    // Every character of the set is illegal as itself: ']', '^', '-' and '\'
    // have no special meaning here.
    for (const QChar c : illegalCharacters) {
        if (name.contains(c))
            return false;
    }
    return true;
}
