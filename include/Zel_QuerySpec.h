// Zel_QuerySpec: the parameters of a search for nodes on the server.
//
// A search text, a time parameter in seconds, the node types and categories
// to search, property conditions (each a key and a value) and three switches.
// It travels as boost::shared_ptr<Zel_QuerySpec> (Zel_QueryCB::setQuerySpec);
// the class only holds the parameters and interprets none of them. The add
// operations append in call order and keep duplicates: a property key added
// twice gives two conditions.
//
//     boost::shared_ptr<Zel_QuerySpec> spec(new Zel_QuerySpec("interview"));
//     spec->addTypeParam("clip");
//     spec->addPropertyParam(Zel_Property(Zel_PropKey_Tape, "T12", QString()));
//
// A plain value: no locks.
#ifndef ZEL_QUERYSPEC_H
#define ZEL_QUERYSPEC_H

#include "zel_export.h"
#include "Zel_Property.h"
#include "Zel_PropertyList.h"

#include <QString>
#include <QStringList>

class ZEL_EXPORT Zel_QuerySpec
{
public:
    // Empty text, time 0, no types, categories or properties, switches false.
    Zel_QuerySpec();
    explicit Zel_QuerySpec(const QString& textParam);
    Zel_QuerySpec(const Zel_QuerySpec& other);
    Zel_QuerySpec& operator=(const Zel_QuerySpec& other);
    virtual ~Zel_QuerySpec();

    // The query's text form: a copy of the search text, nothing else.
    virtual QString getString();

    void setTextParam(const QString& textParam);
    const QString& getTextParam() const;

    // Seconds, stored and returned unchanged (negative values included).
    void setTimeParam(long seconds);
    long getTimeParamAsSeconds() const;

    // Appends one node type; setSelectedTypes replaces the whole list.
    void addTypeParam(const QString& type);
    void setSelectedTypes(QStringList types);
    const QStringList& getSelectedTypes() const;

    void addCategoryParam(const QString& category);
    const QStringList& getCategories() const;

    // A plain append: a key already present is added again.
    void addPropertyParam(const Zel_Property& property);
    const Zel_PropertyList& getProperties() const;

    void setReturnReferencedAssets(bool value);
    bool getReturnReferencedAssets() const;
    void setSearchTextInLocatorsAndAnnotations(bool value);
    bool getSearchTextInLocatorsAndAnnotations() const;
    void setSearchTextInRestrictions(bool value);
    bool getSearchTextInRestrictions() const;

private:
    QString mTextParam;
    long mTimeParam;
    QStringList mSelectedTypes;
    QStringList mCategories;
    Zel_PropertyList mProperties;
    bool mReturnReferencedAssets;
    bool mSearchTextInLocatorsAndAnnotations;
    bool mSearchTextInRestrictions;
};

#endif
