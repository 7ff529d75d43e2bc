// Tokenizer throughput over a generated 10 MB bank statement, in both OFX forms. Every token is
// pulled through OEParseEngine (header lines, then tags and decoded values) as the parser driver
// does, without building objects.
#include "oesdk.h"
#include "statement_gen.h"

#include <benchmark/benchmark.h>

#include <cstdio>
#include <string>

namespace {

const std::string& Document(oesdk_bench::OFXForm form) {
    static const std::string sgml =
        oesdk_bench::StatementGenerator(oesdk_bench::OFXForm::SGML).Generate(10u << 20);
    static const std::string xml =
        oesdk_bench::StatementGenerator(oesdk_bench::OFXForm::XML).Generate(10u << 20);
    return form == oesdk_bench::OFXForm::SGML ? sgml : xml;
}

void Tokenize(benchmark::State& state, oesdk_bench::OFXForm form) {
    const std::string& text = Document(form);
    OEBuffer buffer;
    buffer.WriteLarge(text.data(), static_cast<unsigned long>(text.size()));
    std::size_t tokens = 0, valueBytes = 0;
    for (auto _ : state) {
        OEParseEngine engine(&buffer);
        OEHeaderTag tag;
        OEString name, value;
        while (engine.GetNextHeader(tag, name, value)) {
        }
        const OETagDictionaryEntry* entry = nullptr;
        int kind;
        while ((kind = engine.GetNextToken(entry)) != OETK_ENDOFINPUT) {
            if (kind == OETK_ERROR) {
                state.SkipWithError("tokenizer error");
                return;
            }
            if (kind == OETK_ELEMENT) valueBytes += engine.GetValue().GetStrLength();
            ++tokens;
        }
        benchmark::DoNotOptimize(valueBytes);
    }
    OEParseLogger* log = OEParseLogger::TheOEParseLogger();
    if (log && log->GetNumberParseExceptions())
        state.SkipWithError("the generated statement logged exceptions");
    state.SetBytesProcessed(static_cast<int64_t>(state.iterations()) * static_cast<int64_t>(text.size()));
    state.counters["tokens"] = static_cast<double>(tokens / state.iterations());
}

void BM_TokenizeSgml(benchmark::State& state) {
    Tokenize(state, oesdk_bench::OFXForm::SGML);
}
void BM_TokenizeXml(benchmark::State& state) {
    Tokenize(state, oesdk_bench::OFXForm::XML);
}

BENCHMARK(BM_TokenizeSgml)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_TokenizeXml)->Unit(benchmark::kMillisecond);

} // namespace

int main(int argc, char** argv) {
    OEAttachThread(OEPlatform::CurrentThreadId());
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 1;
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    OEDetachThread(OEPlatform::CurrentThreadId());
    return 0;
}
