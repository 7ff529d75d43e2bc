// Value conversions on the hot path of every parse and build: decimal amounts and date-times,
// text -> value -> text.
#include "oesdk.h"

#include <benchmark/benchmark.h>

namespace {

// The library's conversions report failures to the thread's parse log; attach this thread once.
struct Attach {
    Attach() { OEAttachThread(OEPlatform::CurrentThreadId()); }
} g_attach;

void BM_DecimalRoundTrip(benchmark::State& state) {
    static const char* const kTexts[] = {"-1234.56", "0.01", "1,000,000.00"};
    OEPrecisionInteger n;
    std::size_t i = 0;
    for (auto _ : state) {
        n.ConvertStringToOEPrecisionInteger(kTexts[i]);
        char* text = n;
        benchmark::DoNotOptimize(text);
        i = i == 2 ? 0 : i + 1;
    }
}
BENCHMARK(BM_DecimalRoundTrip);

void BM_DecimalRoundTripWide(benchmark::State& state) {
    OEPrecisionInteger n;
    for (auto _ : state) {
        n.ConvertStringToOEPrecisionInteger("12345678901234567890.12345678");
        char* text = n;
        benchmark::DoNotOptimize(text);
    }
}
BENCHMARK(BM_DecimalRoundTripWide);

void BM_DecimalSum(benchmark::State& state) {
    OEPrecisionInteger a("1234.56"), b("-0.015");
    for (auto _ : state) {
        a += b;
        benchmark::DoNotOptimize(a);
    }
}
BENCHMARK(BM_DecimalSum);

void BM_DateTimeParseFormat(benchmark::State& state) {
    OEDateTime d;
    OEString out;
    for (auto _ : state) {
        d.ConvertStringToOEDateTime("20240131120000.000[-5:EST]");
        d.GetDateString(out);
        benchmark::DoNotOptimize(out.c_str());
    }
}
BENCHMARK(BM_DateTimeParseFormat);

void BM_DateTimeCompare(benchmark::State& state) {
    OEDateTime a("20240131120000.000[-5:EST]"), b("20240131170001");
    for (auto _ : state) benchmark::DoNotOptimize(a < b);
}
BENCHMARK(BM_DateTimeCompare);

// Text to value alone, over the shapes a statement is made of (amounts, dates with and without a
// time, with milliseconds and a zone): the path every parsed element takes.
template <class Convert>
void ParseCycle(benchmark::State& state, const char* const (&texts)[4], Convert convert) {
    std::size_t i = 0;
    for (auto _ : state) {
        benchmark::DoNotOptimize(convert(texts[i]));
        i = (i + 1) & 3;
    }
}

void BM_DecimalParse(benchmark::State& state) {
    static const char* const kTexts[4] = {"-1234.56", "0.01", "1,000,000.00", "4999"};
    OEPrecisionInteger n;
    ParseCycle(state, kTexts, [&n](const char* text) { return n.ConvertStringToOEPrecisionInteger(text); });
}
BENCHMARK(BM_DecimalParse);

void BM_DateTimeParse(benchmark::State& state) {
    static const char* const kTexts[4] = {"20230312120000", "20240105", "20240105120000.000[-5:EST]",
                                          "20231231235959.5"};
    OEDateTime d;
    ParseCycle(state, kTexts, [&d](const char* text) { return d.ConvertStringToOEDateTime(text); });
}
BENCHMARK(BM_DateTimeParse);

void BM_KeywordLookup(benchmark::State& state) {
    OEBankTxType t = OEBTT_CREDIT;
    for (auto _ : state) {
        OEDataConversion::StringToBankTx("DIRECTDEBIT", t);
        benchmark::DoNotOptimize(t);
    }
}
BENCHMARK(BM_KeywordLookup);

} // namespace

BENCHMARK_MAIN();
