// CountingNodeCB: a node callback that does the least an application would,
// look at each payload, and counts the calls. Shared by the benchmarks.
#ifndef ZEL_BENCH_COUNTINGNODECB_H
#define ZEL_BENCH_COUNTINGNODECB_H

#include "Zel_Error.h"
#include "Zel_Node.h"
#include "Zel_ResultCB.h"

#include <benchmark/benchmark.h>
#include <boost/shared_ptr.hpp>

class CountingNodeCB : public Zel_ResultCB
{
public:
    void succeeded(boost::shared_ptr<Zel_Node> node) override
    {
        benchmark::DoNotOptimize(node.get());
        ++mSucceeded;
    }
    void failed(boost::shared_ptr<Zel_Error> error) override
    {
        benchmark::DoNotOptimize(error.get());
        ++mFailed;
    }
    void finished() override { ++mFinished; }

    long mSucceeded = 0;
    long mFailed = 0;
    long mFinished = 0;
};

#endif
