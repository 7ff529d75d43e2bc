// Tag dictionary lookups: by name (exact case and ignoring case) and by id.
// Run: build/bench/bench_tags --benchmark_repetitions=5 --benchmark_report_aggregates_only=true
#include "oesdk.h"

#include <benchmark/benchmark.h>

#include <cctype>
#include <cstring>
#include <string>
#include <vector>

namespace {

struct Names {
    std::vector<std::string> upper, lower;
    Names() {
        const OETagDictionaryEntry* table = GetOETagDictionary();
        for (unsigned short i = 0; i < NumberOfOEDictionaryEntry(); ++i) {
            std::string n = table[i].m_name;
            if (n.empty()) continue;
            upper.push_back(n);
            for (char& c : n) c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
            lower.push_back(n);
        }
    }
};

const Names& AllNames() {
    static Names names;
    return names;
}

void LookupByName(benchmark::State& state, bool lowerCase, OECaseType caseType) {
    OETagDictionary* d = OETagDictionary::TheOETagDictionary();
    const std::vector<std::string>& names = lowerCase ? AllNames().lower : AllNames().upper;
    size_t i = 0;
    for (auto _ : state) {
        const std::string& n = names[i];
        OETagID id;
        benchmark::DoNotOptimize(d->GetTagID(n.data(), static_cast<unsigned short>(n.size()), &id, caseType));
        if (++i == names.size()) i = 0;
    }
    state.SetItemsProcessed(state.iterations());
}

void BM_LookupByNameCaseSensitive(benchmark::State& state) {
    LookupByName(state, false, OECaseSensitive);
}
void BM_LookupByNameIgnoringCase(benchmark::State& state) {
    LookupByName(state, true, OECaseInsensitive);
}

void BM_LookupById(benchmark::State& state) {
    OETagDictionary* d = OETagDictionary::TheOETagDictionary();
    unsigned id = 1;
    for (auto _ : state) {
        benchmark::DoNotOptimize(d->GetTagString(static_cast<OETagID>(id)));
        if (++id > NumberOfOEDictionaryEntry()) id = 1;
    }
    state.SetItemsProcessed(state.iterations());
}

} // namespace

BENCHMARK(BM_LookupByNameCaseSensitive);
BENCHMARK(BM_LookupByNameIgnoringCase);
BENCHMARK(BM_LookupById);

int main(int argc, char** argv) {
    OEAttachThread(OEPlatform::CurrentThreadId());
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    OEDetachThread(OEPlatform::CurrentThreadId());
    return 0;
}
