#include "Zel_QuerySpec.h"

#include <utility>

Zel_QuerySpec::Zel_QuerySpec()
    : mTimeParam(0)
    , mReturnReferencedAssets(false)
    , mSearchTextInLocatorsAndAnnotations(false)
    , mSearchTextInRestrictions(false)
{
}

Zel_QuerySpec::Zel_QuerySpec(const QString& textParam)
    : mTextParam(textParam)
    , mTimeParam(0)
    , mReturnReferencedAssets(false)
    , mSearchTextInLocatorsAndAnnotations(false)
    , mSearchTextInRestrictions(false)
{
}

Zel_QuerySpec::Zel_QuerySpec(const Zel_QuerySpec& other) = default;
Zel_QuerySpec& Zel_QuerySpec::operator=(const Zel_QuerySpec& other) = default;
Zel_QuerySpec::~Zel_QuerySpec() = default;

QString Zel_QuerySpec::getString()
{
    return mTextParam;
}

void Zel_QuerySpec::setTextParam(const QString& textParam)
{
    mTextParam = textParam;
}

const QString& Zel_QuerySpec::getTextParam() const
{
    return mTextParam;
}

void Zel_QuerySpec::setTimeParam(long seconds)
{
    mTimeParam = seconds;
}

long Zel_QuerySpec::getTimeParamAsSeconds() const
{
    return mTimeParam;
}

void Zel_QuerySpec::addTypeParam(const QString& type)
{
    mSelectedTypes.append(type);
}

void Zel_QuerySpec::setSelectedTypes(QStringList types)
{
    mSelectedTypes = std::move(types);
}

const QStringList& Zel_QuerySpec::getSelectedTypes() const
{
    return mSelectedTypes;
}

void Zel_QuerySpec::addCategoryParam(const QString& category)
{
    mCategories.append(category);
}

const QStringList& Zel_QuerySpec::getCategories() const
{
    return mCategories;
}

void Zel_QuerySpec::addPropertyParam(const Zel_Property& property)
{
    // QList::append, not the list's own key-checking adds: duplicates stay.
    mProperties.append(property);
}

const Zel_PropertyList& Zel_QuerySpec::getProperties() const
{
    return mProperties;
}

void Zel_QuerySpec::setReturnReferencedAssets(bool value)
{
    mReturnReferencedAssets = value;
}

bool Zel_QuerySpec::getReturnReferencedAssets() const
{
    return mReturnReferencedAssets;
}

void Zel_QuerySpec::setSearchTextInLocatorsAndAnnotations(bool value)
{
    mSearchTextInLocatorsAndAnnotations = value;
}

bool Zel_QuerySpec::getSearchTextInLocatorsAndAnnotations() const
{
    return mSearchTextInLocatorsAndAnnotations;
}

void Zel_QuerySpec::setSearchTextInRestrictions(bool value)
{
    mSearchTextInRestrictions = value;
}

bool Zel_QuerySpec::getSearchTextInRestrictions() const
{
    return mSearchTextInRestrictions;
}
