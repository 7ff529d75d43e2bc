// End to end: a generated 20,000-transaction bank statement, SGML and XML forms. Parse to a typed
// tree (MB/s of input), build the tree back to text (MB/s of output), and the heap the tree holds
// per byte of input (counter "heap_x_file": live heap after the parse, buffer included, divided
// by the file size).
//
//   ./build/bench_e2e --benchmark_min_time=1
#include "oesdk.h"
#include "statement_gen.h"

#include <benchmark/benchmark.h>

#include <memory>
#include <string>
#if defined(__GLIBC__)
#include <malloc.h>
#endif

namespace {

using oesdk_bench::OFXForm;
using oesdk_bench::StatementGenerator;

const int kTransactions = 20000;

size_t CountTransactions(const std::string& text) {
    size_t n = 0;
    for (size_t at = text.find("<STMTTRN>"); at != std::string::npos; at = text.find("<STMTTRN>", at + 1))
        ++n;
    return n;
}

// A statement with at least 20,000 transactions, made once per form.
const std::string& Document(OFXForm form) {
    static std::string docs[2];
    std::string& doc = docs[form == OFXForm::XML ? 1 : 0];
    if (doc.empty()) {
        size_t target = 2 * 1024 * 1024;
        for (;;) {
            doc = StatementGenerator(form).Generate(target);
            size_t n = CountTransactions(doc);
            if (n >= static_cast<size_t>(kTransactions)) break;
            target = target * kTransactions / (n ? n : 1) + 4096;
        }
    }
    return doc;
}

struct Attached {
    Attached() { OEAttachThread(OEPlatform::CurrentThreadId()); }
};
const Attached attached;

std::unique_ptr<OEBuffer> Load(const std::string& text) {
    std::unique_ptr<OEBuffer> buffer(new OEBuffer(static_cast<unsigned long>(text.size() + 1), 1 << 20));
    buffer->WriteLarge(text.data(), static_cast<unsigned long>(text.size()));
    return buffer;
}

size_t LiveHeap() {
#if defined(__GLIBC__) && (__GLIBC__ > 2 || (__GLIBC__ == 2 && __GLIBC_MINOR__ >= 33))
    return mallinfo2().uordblks;
#else
    return 0;
#endif
}

// The heap a parsed tree holds, measured on one untimed parse: reading the allocator's totals
// walks its free lists, which would otherwise be timed as parsing.
size_t TreeHeap(OEBuffer* buffer) {
    const size_t before = LiveHeap();
    std::unique_ptr<OEFileRs> file(OEDataObj::GetFactory()->NewFileRs(0));
    OESimpleParser parser;
    if (parser.Parse(buffer, file.get(), 0, 0) != OEPS_OK) return 0;
    const size_t after = LiveHeap();
    return after > before ? after - before : 0;
}

void ParseToTree(benchmark::State& state, OFXForm form) {
    const std::string& text = Document(form);
    std::unique_ptr<OEBuffer> buffer = Load(text);
    const size_t treeHeap = TreeHeap(buffer.get());
    for (auto _ : state) {
        std::unique_ptr<OEFileRs> file(OEDataObj::GetFactory()->NewFileRs(0));
        OESimpleParser parser;
        OEParseStatus status = parser.Parse(buffer.get(), file.get(), 0, 0);
        if (status != OEPS_OK) state.SkipWithError("parse failed");
        benchmark::DoNotOptimize(file.get());
        state.PauseTiming(); // freeing the tree is not part of parsing it
        file.reset();
        state.ResumeTiming();
    }
    state.SetBytesProcessed(static_cast<int64_t>(state.iterations()) * static_cast<int64_t>(text.size()));
    state.counters["file_MB"] = static_cast<double>(text.size()) / 1e6;
    state.counters["transactions"] = static_cast<double>(CountTransactions(text));
    if (treeHeap)
        state.counters["heap_x_file"] =
            static_cast<double>(treeHeap + buffer->GetBufferAllocation()) / static_cast<double>(text.size());
}

void BuildToText(benchmark::State& state, OFXForm form) {
    const std::string& text = Document(form);
    std::unique_ptr<OEBuffer> input = Load(text);
    std::unique_ptr<OEFileRs> file(OEDataObj::GetFactory()->NewFileRs(0));
    OESimpleParser parser;
    if (parser.Parse(input.get(), file.get(), 0, 0) != OEPS_OK) {
        state.SkipWithError("parse failed");
        return;
    }
    unsigned long written = 0;
    for (auto _ : state) {
        OEBuffer out(static_cast<unsigned long>(text.size() + 65536), 1 << 20);
        OEBuilder builder(OEBCL_CRLF, form == OFXForm::XML ? 1 : 0);
        if (builder.Build(&out, file.get(), OEBSO_LENIENT, 0, 0) != OEBS_OK)
            state.SkipWithError("build failed");
        written = out.GetBufferSize();
        benchmark::DoNotOptimize(out.GetBufferPtr());
    }
    state.SetBytesProcessed(static_cast<int64_t>(state.iterations()) * static_cast<int64_t>(written));
    state.counters["out_MB"] = static_cast<double>(written) / 1e6;
}

BENCHMARK_CAPTURE(ParseToTree, sgml, OFXForm::SGML)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(ParseToTree, xml, OFXForm::XML)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(BuildToText, sgml, OFXForm::SGML)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(BuildToText, xml, OFXForm::XML)->Unit(benchmark::kMillisecond);

} // namespace

BENCHMARK_MAIN();
