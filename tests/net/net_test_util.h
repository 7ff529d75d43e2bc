// Helpers shared by the transport tests: the log capture, files, the loopback fixture.
#ifndef OESDK_TESTS_NET_TEST_UTIL_H
#define OESDK_TESTS_NET_TEST_UTIL_H

#include "oesdk.h"

#include <cstdio>
#include <cstdlib>
#include <mutex>
#include <string>
#include <vector>

namespace nettest {

// Lines handed to an access's log callback (callbacks may come from the client's thread).
struct LogCapture {
    static std::mutex& Lock() {
        static std::mutex m;
        return m;
    }
    static std::vector<std::string>& Lines() {
        static std::vector<std::string> v;
        return v;
    }
    static void Callback(const char* text, unsigned short level, const char*) {
        std::lock_guard<std::mutex> g(Lock());
        Lines().push_back(std::to_string(level) + " " + text);
    }
    static void Clear() {
        std::lock_guard<std::mutex> g(Lock());
        Lines().clear();
    }
    static bool Has(const std::string& line) {
        std::lock_guard<std::mutex> g(Lock());
        for (const auto& l : Lines())
            if (l == line) return true;
        return false;
    }
    static std::string All() {
        std::lock_guard<std::mutex> g(Lock());
        std::string s;
        for (const auto& l : Lines()) s += l + "\n";
        return s;
    }
};

inline std::string Slurp(const std::string& path) {
    std::string s;
    if (std::FILE* f = _LDfopen(path.c_str(), "rb")) {
        char b[4096];
        size_t n;
        while ((n = std::fread(b, 1, sizeof b, f)) > 0) s.append(b, n);
        std::fclose(f);
    }
    return s;
}

inline void WriteFile(const std::string& path, const std::string& text) {
    if (std::FILE* f = _LDfopen(path.c_str(), "wb")) {
        std::fwrite(text.data(), 1, text.size(), f);
        std::fclose(f);
    }
}

inline bool Exists(const std::string& path) {
    OEFileStat st;
    return _LD_stat(path.c_str(), &st) == 0;
}

// A fresh directory for one test, below the system's temporary directory.
std::string MakeTempDir(const char* name);

inline std::string Trim(std::string s) {
    while (!s.empty() && (s.back() == '\n' || s.back() == '\r' || s.back() == ' ')) s.pop_back();
    return s;
}

// The loopback fixture's folder (ctest sets it); empty when the tests run without it.
inline std::string FixtureDir() {
    const char* d = std::getenv("OESDK_NET_FIXTURE");
    return d ? d : "";
}

inline std::string BufferText(OEBuffer& b) {
    return b.GetBufferPtr() ? std::string(b.GetBufferPtr(), b.GetBufferSize()) : std::string();
}

} // namespace nettest

#endif
