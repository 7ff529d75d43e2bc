// The loops the parse and build benchmarks share: parse a text into a fresh root (MB/s of input, the
// tree's release not timed) and build a parsed tree back to text (MB/s of output). `make` returns a
// new empty root as a std::unique_ptr.
#ifndef OESDK_BENCH_PARSE_BUILD_H
#define OESDK_BENCH_PARSE_BUILD_H
#include "oesdk.h"

#include <benchmark/benchmark.h>

#include <string>

namespace benchutil {

struct Attached {
    Attached() { OEAttachThread(OEPlatform::CurrentThreadId()); }
};

// A root made by `make` and filled from `buffer`, or null when the parse does not answer OK.
template <class Make> auto ParseWith(Make make, OEBuffer* buffer) -> decltype(make()) {
    auto root = make();
    OESimpleParser parser;
    if (!root || parser.Parse(buffer, root.get(), 0, 0) != OEPS_OK) root.reset();
    return root;
}

template <class Make> void ParseLoop(benchmark::State& state, const std::string& text, Make make) {
    OEBuffer buffer(static_cast<unsigned long>(text.size() + 1), 1 << 20);
    buffer.WriteLarge(text.data(), static_cast<unsigned long>(text.size()));
    for (auto _ : state) {
        auto root = ParseWith(make, &buffer);
        if (!root) state.SkipWithError("parse failed");
        benchmark::DoNotOptimize(root.get());
        state.PauseTiming(); // freeing the tree is not part of parsing it
        root.reset();
        state.ResumeTiming();
    }
    state.SetBytesProcessed(static_cast<int64_t>(state.iterations()) * static_cast<int64_t>(text.size()));
}

template <class Make> void BuildLoop(benchmark::State& state, const std::string& text, Make make) {
    OEBuffer in(static_cast<unsigned long>(text.size() + 1), 1 << 20);
    in.WriteLarge(text.data(), static_cast<unsigned long>(text.size()));
    auto root = ParseWith(make, &in);
    if (!root) {
        state.SkipWithError("parse failed");
        return;
    }
    unsigned long written = 0;
    for (auto _ : state) {
        OEBuffer out(static_cast<unsigned long>(text.size() * 2), 1 << 20);
        OEBuilder builder;
        if (builder.Build(&out, root.get(), OEBSO_LENIENT, 0, 0) != OEBS_OK)
            state.SkipWithError("build failed");
        written = out.GetBufferSize();
    }
    state.SetBytesProcessed(static_cast<int64_t>(state.iterations()) * static_cast<int64_t>(written));
}

} // namespace benchutil

#endif
