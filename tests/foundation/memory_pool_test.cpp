// The block pool that string buffers and data objects come from.
#include "alloc_failure.h"
#include "oesdk.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
#if defined(__GLIBC__)
#include <malloc.h>
#endif
#include <random>
#include <thread>
#include <vector>

#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
#define POOL_IS_DIRECT 1
#elif defined(__has_feature)
#if __has_feature(address_sanitizer) || __has_feature(thread_sanitizer) || __has_feature(memory_sanitizer)
#define POOL_IS_DIRECT 1
#endif
#endif

namespace {

struct Block {
    unsigned char* p;
    std::size_t size;
    unsigned char fill;
};

void Fill(const Block& b) {
    std::memset(b.p, b.fill, b.size);
}

bool Intact(const Block& b) {
    for (std::size_t i = 0; i < b.size; ++i)
        if (b.p[i] != b.fill) return false;
    return true;
}

TEST(MemoryPool, BlocksAreAlignedAndKeepTheirBytesThroughMixedUse) {
    // Sizes around the rounding steps, the largest pooled size and heap-sized blocks, allocated and
    // freed in a random order: no block may overlap another or lose a byte.
    const std::size_t sizes[] = {0, 1, 7, 8, 9, 15, 16, 17, 31, 33, 100, 728, 1023, 1024, 1025, 5000};
    std::mt19937 random(7);
    std::vector<Block> live;
    for (int step = 0; step < 20000; ++step) {
        if (!live.empty() && random() % 3 == 0) {
            const std::size_t k = random() % live.size();
            ASSERT_TRUE(Intact(live[k])) << "size " << live[k].size;
            OEMemory::PoolFree(live[k].p);
            live[k] = live.back();
            live.pop_back();
            continue;
        }
        const std::size_t size = sizes[random() % (sizeof sizes / sizeof sizes[0])];
        const bool text = random() % 2 == 0;
        void* p = text ? OEMemory::PoolAllocBytes(size) : OEMemory::PoolAlloc(size);
        ASSERT_NE(p, nullptr);
        EXPECT_EQ(reinterpret_cast<std::uintptr_t>(p) % (text ? 8 : 16), 0u) << "size " << size;
        Block b{static_cast<unsigned char*>(p), size, static_cast<unsigned char>(step)};
        Fill(b);
        live.push_back(b);
    }
    for (const Block& b : live) {
        EXPECT_TRUE(Intact(b));
        OEMemory::PoolFree(b.p);
    }
    OEMemory::PoolFree(nullptr); // ignored
}

TEST(MemoryPool, FailureHookAndErrorCodeApply) {
    OEThreadState::SetErrorCode(OETE_NONE);
    {
        FailAllocations fail;
        EXPECT_EQ(OEMemory::PoolAlloc(16), nullptr);
        EXPECT_EQ(OEMemory::PoolAllocBytes(5000), nullptr);
    }
    EXPECT_EQ(OEThreadState::GetErrorCode(), OETE_OUTOFMEMORY);
    OEThreadState::SetErrorCode(OETE_NONE);
}

#if !defined(POOL_IS_DIRECT)
TEST(MemoryPool, CurrentSlabStartsOverOnceEverythingCutFromItIsBack) {
    // Transient texts of a thread reuse the same memory instead of walking through new slabs.
    void* first = OEMemory::PoolAllocBytes(40);
    void* second = OEMemory::PoolAllocBytes(40);
    OEMemory::PoolFree(first);
    OEMemory::PoolFree(second);
    // Everything of this thread's current slab may still be held by other tests' objects; the
    // start-over is certain only on a thread of its own.
    void* again = nullptr;
    void* firstThere = nullptr;
    std::thread([&] {
        firstThere = OEMemory::PoolAllocBytes(40);
        OEMemory::PoolFree(firstThere);
        again = OEMemory::PoolAllocBytes(40);
        OEMemory::PoolFree(again);
    }).join();
    EXPECT_EQ(again, firstThere);
}

#if defined(__GLIBC__) && (__GLIBC__ > 2 || (__GLIBC__ == 2 && __GLIBC_MINOR__ >= 33))
TEST(MemoryPool, SlabsGoBackOnceTheirThreadAndBlocksAreGone) {
    // Small and larger blocks over several slabs, cut on a thread that then ends and freed here:
    // each slab goes back to the heap with its last block, none is kept or freed early.
    for (std::size_t size : {8u, 100u}) {
        std::vector<void*> blocks;
        blocks.reserve(6000);
        const std::size_t before = mallinfo2().uordblks;
        std::thread([&] {
            for (int i = 0; i < 6000; ++i) blocks.push_back(OEMemory::PoolAllocBytes(size));
        }).join();
        for (void* p : blocks) {
            ASSERT_NE(p, nullptr);
            std::memset(p, 0x5A, size);
        }
        for (void* p : blocks) OEMemory::PoolFree(p);
        EXPECT_LT(mallinfo2().uordblks, before + 16 * 1024) << "size " << size;
    }
}
#endif
#endif

// A host's own data object class: `new` and `delete` go through the pool, across threads too.
class HostObject : public OEDataObj {
public:
    char m_payload[200] = {};
};

TEST(MemoryPool, DataObjectsMadeOnOneThreadAreDeletedOnAnother) {
    std::vector<OEDataObj*> made;
    std::thread([&] {
        for (int i = 0; i < 2000; ++i) {
            HostObject* o = new HostObject;
            std::memset(o->m_payload, i & 0xFF, sizeof o->m_payload);
            made.push_back(o);
        }
    }).join(); // the making thread has ended: its slabs now live on their blocks alone
    for (std::size_t i = 0; i < made.size(); ++i) {
        HostObject* o = static_cast<HostObject*>(made[i]);
        ASSERT_EQ(o->m_payload[199], static_cast<char>(i & 0xFF));
        delete o;
    }
    HostObject* plain = new (std::nothrow) HostObject;
    ASSERT_NE(plain, nullptr);
    delete plain;
}

} // namespace
