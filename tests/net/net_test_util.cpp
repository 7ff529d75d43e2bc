#include "net_test_util.h"

#include <gtest/gtest.h>

#include <atomic>
#include <filesystem>

namespace nettest {

std::string MakeTempDir(const char* name) {
    static std::atomic<int> counter{0};
    std::error_code ec;
    std::filesystem::path base = std::filesystem::temp_directory_path(ec);
    std::filesystem::path dir = base / ("oesdk-net-" + std::to_string(OEPlatform::CurrentThreadId()) + "-" +
                                        std::to_string(counter++) + "-" + name);
    std::filesystem::remove_all(dir, ec);
    std::filesystem::create_directories(dir, ec);
    return dir.string();
}

} // namespace nettest
