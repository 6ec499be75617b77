// The request classes: every one has the same three members, so they are
// defined here once for each line of the catalogue (zel_requests.def).

#include "zel_request_headers.h"

#include "Orv_ResultsCB.h"

#include <utility>

// A request on Zel_Req takes its name as a QString; one on Orv_Request builds
// the engine's name from the literal directly.
#define ZEL_REQUEST_NAME_Zel_Req(literal) QStringLiteral(literal)
#define ZEL_REQUEST_NAME_Orv_Request(literal) std::string(literal)

#define ZEL_REQUEST(Stem, Base, Name, Params, ArgNames)                                    \
    Zel_##Stem##Req::Zel_##Stem##Req(boost::shared_ptr<Orv_ResultsCB> callback)        \
        : Base(ZEL_REQUEST_NAME_##Base(Name), std::move(callback))                     \
    {                                                                                  \
    }                                                                                  \
    Zel_##Stem##Req::Zel_##Stem##Req(const Zel_##Stem##Req& other) = default;          \
    Zel_##Stem##Req::~Zel_##Stem##Req() = default;
#include "zel_requests.def"
#undef ZEL_REQUEST
