// Open orders: a generated INVOOLIST of 10,000 orders (the eleven kinds in turn), parsed into the
// list (MB/s of input) and built back to text (MB/s of output).
//
//   ./build-rel/bench_openorder --benchmark_min_time=1
#include "oesdk.h"

#include <benchmark/benchmark.h>

#include <memory>
#include <string>

namespace {

const int kOrders = 10000;
const char* const kKinds[][2] = {
    {"OOBUYDEBT", "<AUCTION>N"},
    {"OOBUYMF", "<BUYTYPE>BUY<UNITTYPE>SHARES"},
    {"OOBUYOPT", "<OPTBUYTYPE>BUYTOOPEN"},
    {"OOBUYOTHER", "<UNITTYPE>CURRENCY"},
    {"OOBUYSTOCK", "<BUYTYPE>BUY"},
    {"OOSELLDEBT", ""},
    {"OOSELLMF", "<SELLTYPE>SELL<UNITTYPE>SHARES<SELLALL>Y"},
    {"OOSELLOPT", "<OPTSELLTYPE>SELLTOCLOSE"},
    {"OOSELLOTHER", "<UNITTYPE>SHARES"},
    {"OOSELLSTOCK", "<SELLTYPE>SELLSHORT"},
    {"OOSWITCHMF", "<SECID><UNIQUEID>999<UNIQUEIDTYPE>CUSIP</SECID><UNITTYPE>SHARES<SWITCHALL>N"},
};

// The body of the list, as the list is handed it.
const std::string& Body() {
    static std::string body;
    if (!body.empty()) return body;
    for (int i = 0; i < kOrders; ++i) {
        const char* const* k = kKinds[i % 11];
        std::string n = std::to_string(i);
        body += std::string("<") + k[0] + "><OO><FITID>" + n + "<SECID><UNIQUEID>" + n +
                "<UNIQUEIDTYPE>CUSIP</SECID><DTPLACED>20240105120000<UNITS>" + std::to_string(1 + i % 500) +
                "<SUBACCT>CASH<DURATION>GOODTILCANCEL<RESTRICTION>NONE<LIMITPRICE>" +
                std::to_string(10 + i % 90) + ".25</OO>" + k[1] + "</" + k[0] + ">";
    }
    return body;
}

struct Attached {
    Attached() { OEAttachThread(OEPlatform::CurrentThreadId()); }
};
const Attached attached;

std::unique_ptr<OEInvOOList> Parse(OEBuffer* buffer) {
    std::unique_ptr<OEInvOOList> list(OEDataObj::GetFactory()->NewInvOOList(1));
    OESimpleParser parser;
    if (parser.Parse(buffer, list.get(), 0, 0) != OEPS_OK) return nullptr;
    return list;
}

void OpenOrderParse(benchmark::State& state) {
    const std::string& text = Body();
    OEBuffer buffer(static_cast<unsigned long>(text.size() + 1), 1 << 20);
    buffer.WriteLarge(text.data(), static_cast<unsigned long>(text.size()));
    for (auto _ : state) {
        std::unique_ptr<OEInvOOList> list = Parse(&buffer);
        if (!list || list->GetNumOpenOrder() != kOrders) state.SkipWithError("parse failed");
        state.PauseTiming(); // freeing the tree is not part of parsing it
        list.reset();
        state.ResumeTiming();
    }
    state.SetBytesProcessed(static_cast<int64_t>(state.iterations()) * static_cast<int64_t>(text.size()));
}
BENCHMARK(OpenOrderParse)->Unit(benchmark::kMillisecond);

void OpenOrderBuild(benchmark::State& state) {
    const std::string& text = Body();
    OEBuffer in(static_cast<unsigned long>(text.size() + 1), 1 << 20);
    in.WriteLarge(text.data(), static_cast<unsigned long>(text.size()));
    std::unique_ptr<OEInvOOList> list = Parse(&in);
    if (!list) {
        state.SkipWithError("parse failed");
        return;
    }
    unsigned long written = 0;
    for (auto _ : state) {
        OEBuffer out(static_cast<unsigned long>(text.size() * 2), 1 << 20);
        OEBuilder builder;
        if (builder.Build(&out, list.get(), OEBSO_LENIENT, 0, 0) != OEBS_OK)
            state.SkipWithError("build failed");
        written = out.GetBufferSize();
    }
    state.SetBytesProcessed(static_cast<int64_t>(state.iterations()) * static_cast<int64_t>(written));
}
BENCHMARK(OpenOrderBuild)->Unit(benchmark::kMillisecond);

} // namespace

BENCHMARK_MAIN();
