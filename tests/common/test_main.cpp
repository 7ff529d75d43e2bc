// Shared main of every test executable: attaches the test thread for the whole run.
#include "oesdk.h"

#include <gtest/gtest.h>

namespace {
class AttachedThreadEnvironment : public ::testing::Environment {
public:
    void SetUp() override { OEAttachThread(OEPlatform::CurrentThreadId()); }
    void TearDown() override { OEDetachThread(OEPlatform::CurrentThreadId()); }
};
} // namespace

int main(int argc, char** argv) {
    ::testing::InitGoogleTest(&argc, argv);
    ::testing::AddGlobalTestEnvironment(new AttachedThreadEnvironment);
    return RUN_ALL_TESTS();
}
