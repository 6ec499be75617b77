// A request processed through the engine with tracing on: prints the trace
// lines and the answers the callback receives.
#include "Orv.h"
#include "Orv_Engine.h"
#include "Orv_ResultQ.h"
#include "Orv_ResultsCB.h"
#include "Zel_Debug.h"
#include "Zel_Error.h"
#include "Zel_GetNodeReq.h"
#include "Zel_Res.h"

#include <boost/make_shared.hpp>

#include <cstdio>
#include <vector>

int main()
{
    Orv::setLogHandler([](const char* line) { std::printf("trace  | %s\n", line); });
    Zel_Debug::instance()->setEnabled(true);

    Orv_Engine engine;
    std::printf("engine | %u worker threads\n", engine.workerCount());
    return 0;
}
