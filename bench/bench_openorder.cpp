// Open orders: a generated INVOOLIST of 10,000 orders (the eleven kinds in turn), parsed into the
// list (MB/s of input) and built back to text (MB/s of output).
//
//   ./build-rel/bench_openorder --benchmark_min_time=1
#include "parse_build.h"

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

const benchutil::Attached attached;

std::unique_ptr<OEInvOOList> NewRoot() {
    return std::unique_ptr<OEInvOOList>(OEDataObj::GetFactory()->NewInvOOList(1));
}

void OpenOrderParse(benchmark::State& state) {
    benchutil::ParseLoop(state, Body(), NewRoot);
}
BENCHMARK(OpenOrderParse)->Unit(benchmark::kMillisecond);

void OpenOrderBuild(benchmark::State& state) {
    benchutil::BuildLoop(state, Body(), NewRoot);
}
BENCHMARK(OpenOrderBuild)->Unit(benchmark::kMillisecond);

} // namespace

BENCHMARK_MAIN();
