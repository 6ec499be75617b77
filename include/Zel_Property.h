// Zel_Property: one property of a node, a key with its value.
//
// A plain value: key, value and custom values (the last carried as one text,
// never interpreted here). Questions about the key (display name, internal
// name, modifiable, type, ...) go to a property manager: the one passed as an
// argument, else the registered one, else a fixed fallback answer (empty text
// for names, true for the yes/no questions; getHasCustomValues: false).
//
//     Zel_Property::setPropertyManagerSP(manager);   // held weakly
//     Zel_Property p(Zel_PropKey_Name, "clip 1", QString());
//     QString shown = p.displayName();              // asks the registered manager
//
// The registration is a process-wide weak reference, read and written
// atomically: any thread may register, clear or ask at any time. Once the
// registered manager is destroyed by its owner, the registration reads as
// empty. A question asked while another thread registers a new manager may
// still be answered by the previous one.
#ifndef ZEL_PROPERTY_H
#define ZEL_PROPERTY_H

#include "zel_export.h"
#include "Zel_PropertyKeyType.h"

#include <QString>
#include <boost/shared_ptr.hpp>
#include <boost/weak_ptr.hpp>

class Zel_PropertyManager;

class ZEL_EXPORT Zel_Property
{
public:
    // Key, value and custom values are all null texts.
    Zel_Property();
    Zel_Property(const QString& key, const QString& value, const QString& customValues);
    Zel_Property(const Zel_Property& other);
    Zel_Property& operator=(const Zel_Property& other);
    virtual ~Zel_Property();

    QString key() const;
    QString value() const;
    QString customValues() const;
    void setValue(const QString& value);

    // True when the key and the value are both empty (custom values ignored).
    bool isEmpty() const;
    // Keys and values equal, case-sensitive; custom values are not compared.
    bool operator==(const Zel_Property& other) const;
    bool operator!=(const Zel_Property& other) const;

    // The trace form "Zel_Property(<key>:<value>:<display name>:<internal name>)",
    // the two names taken from the registered manager (empty without one).
    operator QString() const;

    // Questions about this property's key. An empty manager means the
    // registered one; without any manager the fallbacks apply.
    QString displayName(boost::shared_ptr<Zel_PropertyManager> manager = boost::shared_ptr<Zel_PropertyManager>()) const;
    QString internalName(boost::shared_ptr<Zel_PropertyManager> manager = boost::shared_ptr<Zel_PropertyManager>()) const;
    bool isAvailable(boost::shared_ptr<Zel_PropertyManager> manager = boost::shared_ptr<Zel_PropertyManager>()) const;
    bool isModifiable(boost::shared_ptr<Zel_PropertyManager> manager = boost::shared_ptr<Zel_PropertyManager>()) const;
    bool isTextSearchable(boost::shared_ptr<Zel_PropertyManager> manager = boost::shared_ptr<Zel_PropertyManager>()) const;
    bool isType(Zel_PropertyKeyType type, boost::shared_ptr<Zel_PropertyManager> manager = boost::shared_ptr<Zel_PropertyManager>()) const;
    // True when the key is of either resolution type (2 or 3).
    bool isResolution(boost::shared_ptr<Zel_PropertyManager> manager = boost::shared_ptr<Zel_PropertyManager>()) const;

    // Questions about any key, always asked of the registered manager.
    static QString getDisplayName(const QString& key);
    static QString getKeyByDisplayName(const QString& displayName);
    static bool getHasCustomValues(const QString& key);
    static bool getIsModifiable(const QString& key);
    static bool getIsType(Zel_PropertyKeyType type, const QString& key);

    // Registers the manager (weakly); an empty pointer unregisters.
    static void setPropertyManagerSP(boost::shared_ptr<Zel_PropertyManager> manager);
    // The registered manager, or an empty pointer when none is registered or
    // it has been destroyed.
    static boost::shared_ptr<Zel_PropertyManager> getPropertyManagerSP();

private:
    QString mKey;
    QString mValue;
    QString mCustomValues;

    static boost::weak_ptr<Zel_PropertyManager> mPropertyManagerWP;
};

#endif
