#include "alloc_failure.h"
#include "oesdk.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {
std::vector<std::string> g_messages;
void Capture(int, int, const char*, int, const char*, const char* text) {
    g_messages.push_back(text);
}

struct Counted {
    static int alive;
    Counted() { ++alive; }
    ~Counted() { --alive; }
};
int Counted::alive = 0;

class ArrayProbe : public OEDynamicArray {
public:
    using OEDynamicArray::OEDynamicArray;
    using OEDynamicArray::StoreAt;
};
} // namespace

TEST(OEDynamicArray, GrowsByTheIncrementAndFillsGapsWithNull) {
    ArrayProbe a(0, 0); // both raised to 1
    int x = 1, y = 2;
    EXPECT_EQ(a.Capacity(), 0);
    EXPECT_EQ(a.StoreAt(0, &x), 1);
    EXPECT_EQ(a.Capacity(), 1);
    ArrayProbe b(2, 3);
    EXPECT_EQ(b.StoreAt(4, &y), 1);
    EXPECT_EQ(b.Capacity(), 5); // 2, then 5
    EXPECT_EQ(b.Entries(), 5);
}

TEST(OEDynamicArray, BuildOnTheBaseIsAMisuse) {
    Util::MessageFunctor old = Util::GetOps().SetMessageFunctor(&Capture);
    g_messages.clear();
    OEDynamicArray a;
    EXPECT_EQ(a.Build(nullptr, OETAG_STMTTRN), OEBS_ILLEGALUSE);
    Util::GetOps().SetMessageFunctor(old);
    ASSERT_EQ(g_messages.size(), 1u);
    EXPECT_EQ(g_messages[0], "Illegal use of OEDynamicArray::Build");
}

TEST(OEPtrArray, OwnershipDisconnectAndReplace) {
    {
        OEPtrArray<Counted> owning(1, 1);
        for (int i = 0; i < 4; ++i) owning.Append(new Counted);
        EXPECT_EQ(Counted::alive, 4);
        Counted* kept = owning.Disconnect(1);
        EXPECT_EQ(owning.Entries(), 3);
        EXPECT_EQ(Counted::alive, 4);
        delete kept;
        owning.Set(0, new Counted); // replacing deletes the old one
        EXPECT_EQ(Counted::alive, 3);
        owning.Insert(0, new Counted);
        EXPECT_EQ(owning.Entries(), 4);
    }
    EXPECT_EQ(Counted::alive, 0);
    Counted stackObject;
    {
        OEPtrArray<Counted, false> borrowing;
        borrowing.Append(&stackObject);
    }
    EXPECT_EQ(Counted::alive, 1);
}

TEST(OEPtrArray, InsertKeepsOrder) {
    int v[5] = {0, 1, 2, 3, 4};
    OEPtrArray<int, false> a(1, 1);
    a.Append(&v[1]);
    a.Append(&v[3]);
    a.Insert(0, &v[0]);
    a.Insert(2, &v[2]);
    a.Insert(4, &v[4]);
    ASSERT_EQ(a.Entries(), 5);
    for (unsigned short i = 0; i < 5; ++i) EXPECT_EQ(*a[i], i);
    EXPECT_EQ(a.Insert(9, &v[0]), 0);
    EXPECT_EQ(a.Get(7), nullptr);
}

TEST(OEDynamicArrayString, CopiesAndSpecLength) {
    OEDynamicArrayStringLen list(12);
    list.AddString("first");
    list.AddString(OEString("second"));
    list.SetString(0, "replaced");
    ASSERT_EQ(list.Entries(), 2);
    EXPECT_STREQ(*list.GetString(0), "replaced");
    EXPECT_EQ(list.GetString(1)->SpecLength(), 12);
    EXPECT_EQ(list.GetString(0)->SpecLength(), 12);
    list.SetSpecLength(3);
    EXPECT_EQ(list.GetString(1)->ExceedsSpecLength(), 1);
    OEDynamicArrayString copy;
    copy.DeepCopyFrom(list);
    ASSERT_EQ(copy.Entries(), 2);
    EXPECT_STREQ(*copy.GetString(1), "second");
    EXPECT_EQ(copy.GetString(2), nullptr);
}

TEST(OEDynamicArrayString, GapsLeftByAStorePastTheEnd) {
    OEDynamicArrayStringLen list(4);
    ASSERT_EQ(list.Set(2, new OEString("c")), 1); // entries 0 and 1 stay null
    list.SetSpecLength(1);
    OEDynamicArrayString copy;
    EXPECT_EQ(copy.DeepCopyFrom(list), 1);
    ASSERT_EQ(copy.Entries(), 3);
    EXPECT_EQ(copy.GetString(0), nullptr);
    EXPECT_EQ(list.SetString(0, "a"), 1);
    ASSERT_NE(list.GetString(0), nullptr);
    EXPECT_STREQ(*list.GetString(0), "a");
    EXPECT_EQ(list.GetString(0)->SpecLength(), 1);
}

TEST(OEDynamicArrayString, AllocationFailureFailsTheStore) {
    OEThreadState::SetErrorCode(0);
    OEDynamicArrayString list(1, 1);
    EXPECT_EQ(list.AddString("a"), 1);
    {
        FailAllocations fail;
        EXPECT_EQ(list.AddString("b"), 0);
    }
    EXPECT_EQ(list.Entries(), 1);
    EXPECT_EQ(OEThreadState::GetErrorCode(), 1u);
    {
        FailAllocations fail(2); // the string and its text, then the block fails to grow
        EXPECT_EQ(list.AddString("c"), 0);
    }
    EXPECT_EQ(list.Entries(), 1);
    OEThreadState::SetErrorCode(0);
}
