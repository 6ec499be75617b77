// Zel_PropertyManager: answers questions about property keys.
//
// The library keeps no table of key attributes. The application or the
// backend implements this interface and registers one instance with
// Zel_Property::setPropertyManagerSP(); Zel_Property forwards its questions
// (display name, internal name, modifiable, type, ...) to it. The library
// holds the registered manager only weakly: its owner keeps it alive.
// The operations run on whichever thread asks the question.
#ifndef ZEL_PROPERTYMANAGER_H
#define ZEL_PROPERTYMANAGER_H

#include "zel_export.h"
#include "Zel_PropertyKeyType.h"

#include <QString>
#include <QStringList>

class ZEL_EXPORT Zel_PropertyManager
{
public:
    Zel_PropertyManager();
    Zel_PropertyManager(const Zel_PropertyManager& other);
    Zel_PropertyManager& operator=(const Zel_PropertyManager& other);
    virtual ~Zel_PropertyManager();

    // The name of the key shown to users.
    virtual QString getDisplayName(const QString& key) = 0;
    // Whether a property with this key may be changed.
    virtual bool getIsModifiable(const QString& key) = 0;
    // Whether the key is available.
    virtual bool getIsAvailable(const QString& key) = 0;
    // The internal name of the key.
    virtual QString getInternalName(const QString& key) = 0;
    // Whether the key has the given type.
    virtual bool getIsType(Zel_PropertyKeyType type, const QString& key) = 0;
    // Whether the values of the key can be searched as text.
    virtual bool getIsTextSearchable(const QString& key) = 0;
    // Whether the key has a list of custom values.
    virtual bool getHasCustomValues(const QString& key) = 0;
    // Every key the manager knows. Not called by the library itself.
    virtual QStringList getKeys() = 0;
    // The key whose display name is displayName (empty when there is none).
    virtual QString getKeyByDisplayName(const QString& displayName) = 0;
};

#endif
