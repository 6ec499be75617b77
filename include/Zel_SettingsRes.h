// Zel_SettingsRes: answers of settings requests, each settings as one text.
//
// The backend creates it with the request's Zel_SettingsCB and the final-
// result flag and adds the answers in order with setResult(text, error). The
// engine then calls deliverNext() once per answer: succeeded(text) for a
// success, failed(error) for an error record that reports an error, and
// finished() after the last answer of a final result. An empty error pointer
// counts as "no error". Delivery is that of Zel_GenericRes. Filled by one
// thread, then delivered; no lock.
#ifndef ZEL_SETTINGSRES_H
#define ZEL_SETTINGSRES_H

#include "zel_export.h"
#include "Zel_GenericRes.h"
#include "Zel_SettingsCB.h"

#include <QString>
#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;

class ZEL_EXPORT Zel_SettingsRes : public Zel_GenericRes<Zel_SettingsRes, Zel_SettingsCB>
{
public:
    // One answer: the settings text, its error record.
    class ResultItem
    {
    public:
        ResultItem(QString text, boost::shared_ptr<Zel_Error> error);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        QString mText;
        boost::shared_ptr<Zel_Error> mError;
    };

    Zel_SettingsRes(boost::shared_ptr<Zel_SettingsCB> callback, bool finalResult);
    Zel_SettingsRes(const Zel_SettingsRes& other);
    Zel_SettingsRes& operator=(const Zel_SettingsRes& other);
    virtual ~Zel_SettingsRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(QString text, boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_SettingsCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_SettingsRes, Zel_SettingsCB>;
    static void callSucceeded(Zel_SettingsCB& callback, const ResultItem& item);
};

#endif
