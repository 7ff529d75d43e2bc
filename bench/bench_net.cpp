// Transport: loading replies from disk (the "file:" path, and the receiver's blocked reads
// into a growing buffer).
#include "oesdk.h"

#include <benchmark/benchmark.h>

#include <cstdio>
#include <filesystem>
#include <string>

namespace {

struct ReplyFile {
    std::string dir, path, url;
    explicit ReplyFile(size_t size) {
        dir = (std::filesystem::temp_directory_path() / ("oesdk-bench-net-" + std::to_string(size))).string();
        std::filesystem::create_directories(dir);
        path = dir + "/RECV.DAT";
        std::string text(size, 'x');
        std::FILE* f = std::fopen(path.c_str(), "wb");
        std::fwrite(text.data(), 1, text.size(), f);
        std::fclose(f);
        char buffer[1024];
        OENetRequest::ConvertLocalFileNameToFileURL(buffer, sizeof buffer, path.c_str());
        url = buffer;
    }
    ~ReplyFile() {
        std::error_code ec;
        std::filesystem::remove_all(dir, ec);
    }
};

void BM_FileAddressLoadReply(benchmark::State& state) {
    ReplyFile file(static_cast<size_t>(state.range(0)));
    LocalAccess access;
    OENetRequest* r = access.NewNetRequest();
    r->Get(OEString(file.url.c_str()));
    for (auto _ : state) {
        OEBuffer reply;
        if (r->LoadReply(&reply) != OENetOK) state.SkipWithError("load failed");
        benchmark::DoNotOptimize(reply.GetBufferPtr());
    }
    state.SetBytesProcessed(state.iterations() * state.range(0));
    access.DeleteNetRequest(r);
}
BENCHMARK(BM_FileAddressLoadReply)->Arg(64 << 10)->Arg(1 << 20)->Arg(16 << 20);

class DirRequest : public ReceiverRequest {
public:
    explicit DirRequest(std::string dir) : m_dir(std::move(dir)) {}

protected:
    void BuildFileSpec(const char* name, char* out) override {
        std::snprintf(out, 1024, "%s/%s", m_dir.c_str(), name);
    }

private:
    std::string m_dir;
};

void BM_ReceiverLoadReply(benchmark::State& state) {
    ReplyFile file(static_cast<size_t>(state.range(0)));
    DirRequest r(file.dir);
    r.Get(OEString(""));
    for (auto _ : state) {
        OEBuffer reply; // default growth: the reply size decides the allocation
        if (r.LoadReply(&reply) != OENetOK) state.SkipWithError("load failed");
        benchmark::DoNotOptimize(reply.GetBufferPtr());
    }
    state.SetBytesProcessed(state.iterations() * state.range(0));
}
BENCHMARK(BM_ReceiverLoadReply)->Arg(64 << 10)->Arg(1 << 20)->Arg(16 << 20);

} // namespace

BENCHMARK_MAIN();
