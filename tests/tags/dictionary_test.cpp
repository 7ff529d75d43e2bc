#include "oesdk.h"

#include <gtest/gtest.h>

#include <cctype>
#include <set>
#include <string>
#include <type_traits>

TEST(TagTable, CountIdsAndNames) {
    const OETagDictionaryEntry* table = GetOETagDictionary();
    const unsigned short count = NumberOfOEDictionaryEntry();
    ASSERT_EQ(count, 1448);
    std::set<unsigned> ids;
    std::set<std::string> names;
    int empty = 0;
    for (unsigned short i = 0; i < count; ++i) {
        ids.insert(table[i].m_id);
        std::string name = table[i].m_name;
        if (name.empty()) {
            ++empty;
            EXPECT_GE(table[i].m_id, 1221u);
            EXPECT_LE(table[i].m_id, 1235u);
            continue;
        }
        EXPECT_TRUE(names.insert(name).second) << "repeated name " << name;
        for (char c : name)
            EXPECT_TRUE(std::isupper(static_cast<unsigned char>(c)) || std::isdigit(c) || c == '.') << name;
    }
    EXPECT_EQ(empty, 15);
    ASSERT_EQ(ids.size(), 1448u);
    EXPECT_EQ(*ids.begin(), 1u);
    EXPECT_EQ(*ids.rbegin(), 1448u);
}

TEST(TagDictionary, ReservedRowsHaveNoName) {
    OETagDictionary* d = OETagDictionary::TheOETagDictionary();
    ASSERT_NE(d, nullptr);
    EXPECT_EQ(d->GetLookupMode(), TagDictionary::kContiguous);
    EXPECT_EQ(d->GetLowestID(), 1u);
    for (unsigned id = 1221; id <= 1235; ++id) EXPECT_STREQ(d->GetTagString(static_cast<OETagID>(id)), "");
    OETagID id = OETAG_OFX;
    EXPECT_NE(d->GetTagID("", 0, &id, OECaseSensitive), nullptr); // one of the reserved rows
    EXPECT_GE(id, 1221u);
    EXPECT_LE(id, 1235u);
}

TEST(TagDictionary, CaseRulesAndSlices) {
    OETagDictionary* d = OETagDictionary::TheOETagDictionary();
    ASSERT_NE(d, nullptr);
    OETagID id = OETAG_OFX;
    EXPECT_EQ(d->GetTagID("stmttrnrs", 9, &id, OECaseSensitive), nullptr);
    EXPECT_EQ(id, OETAG_NONE);
    const OETagDictionaryEntry* upper = d->GetTagID("STMTTRNRS", 9, &id, OECaseSensitive);
    EXPECT_EQ(id, OETAG_STMTTRNRS);
    EXPECT_EQ(d->GetTagID("k.payrollrq", 11, &id, OECaseInsensitive)->m_id, OETAG_K_PAYROLLRQ);
    EXPECT_EQ(d->GetTagID("STMTTRNRSX", 9, &id, OECaseSensitive), upper); // a slice of a longer text
    EXPECT_EQ(d->GetTagID("STMTTRNRSX", 10, &id, OECaseSensitive), nullptr);
    EXPECT_EQ(d->GetTagID("NOSUCHTAG", 9, &id, OECaseInsensitive), nullptr);
    EXPECT_EQ(id, OETAG_NONE);
}

TEST(TagDictionary, CustomTablesChooseTheirLookupMode) {
    static const OETagDictionaryEntry gap[] = {{static_cast<OETagID>(5), "FIVE"},
                                               {static_cast<OETagID>(6), "SIX"},
                                               {static_cast<OETagID>(8), "EIGHT"}};
    static const OETagDictionaryEntry dense[] = {
        {static_cast<OETagID>(12), "C"}, {static_cast<OETagID>(10), "A"}, {static_cast<OETagID>(11), "BB"}};
    TagDictionary g(gap, 3);
    EXPECT_EQ(g.GetLookupMode(), TagDictionary::kBinarySearch);
    EXPECT_STREQ(g.GetTagString(static_cast<OETagID>(8)), "EIGHT");
    EXPECT_EQ(g.GetTagString(static_cast<OETagID>(7)), nullptr);
    TagDictionary d(dense, 3);
    EXPECT_EQ(d.GetLookupMode(), TagDictionary::kContiguous);
    EXPECT_EQ(d.GetLowestID(), 10u);
    EXPECT_STREQ(d.GetTagString(static_cast<OETagID>(10)), "A");
    EXPECT_STREQ(d.GetTagString(static_cast<OETagID>(12)), "C");
    OETagID id = OETAG_NONE;
    EXPECT_NE(d.GetTagID("BB", 2, &id, OECaseSensitive), nullptr);
    EXPECT_EQ(id, 11u);
    TagDictionary none(nullptr, 0);
    EXPECT_EQ(none.GetTagID("A", 1, &id, OECaseSensitive), nullptr);

    OEMemory::FailureHook old = OEMemory::SetFailureHook([](std::size_t) { return 1; });
    TagDictionary noIndex(dense, 3); // unusable, but an id lookup must not crash
    OEMemory::SetFailureHook(old);
    EXPECT_FALSE(noIndex.IsUsable());
    EXPECT_EQ(noIndex.GetTagID("A", 1, &id, OECaseSensitive), nullptr);
    EXPECT_STREQ(noIndex.GetTagString(static_cast<OETagID>(11)), "BB");
    OEThreadState::SetErrorCode(0);
}

// Compare and Count are the search object's first two slots: no virtual destructor before them.
static_assert(!std::has_virtual_destructor<OEBinarySearch>::value, "OEBinarySearch slot order");

TEST(TagDictionary, NameOrderIsLengthFirst) {
    OECompareInfo a{nullptr, 0}, b{nullptr, 0};
    const OETagDictionaryEntry z{static_cast<OETagID>(1), "Z"}, aa{static_cast<OETagID>(2), "AA"};
    a.m_entry = &z;
    a.m_length = 1;
    b.m_entry = &aa;
    b.m_length = 2;
    EXPECT_LT(TagDictionary::sCompare(a, b), 0);
    EXPECT_GT(TagDictionary::sCompareTag(&b, &a), 0);
    OEIdIndexInfo i1{0, static_cast<OETagID>(3)}, i2{1, static_cast<OETagID>(0x10002)}; // low 16 bits only
    EXPECT_GT(TagDictionary::sCompareTagID(&i1, &i2), 0);
}

TEST(TagDictionary, DestroyAndRebuild) {
    EXPECT_EQ(OETagDictionary::Destroy(nullptr), 0);
    OETagDictionary* first = OETagDictionary::TheOETagDictionary();
    ASSERT_NE(first, nullptr);
    EXPECT_EQ(OETagDictionary::TheOETagDictionary(), first);
    EXPECT_EQ(OETagDictionary::Destroy(first), 0);
    EXPECT_EQ(OETagDictionary::ms_theOETagDictionary.load(), nullptr);
    OETagDictionary* second = OETagDictionary::TheOETagDictionary();
    ASSERT_NE(second, nullptr);
    EXPECT_STREQ(second->GetTagString(OETAG_STMTTRNRS), "STMTTRNRS");
    {
        OETagDictionary local; // the end of any dictionary clears the singleton pointer
    }
    EXPECT_EQ(OETagDictionary::ms_theOETagDictionary.load(), nullptr);
    OETagDictionary::Destroy(second);
    ASSERT_NE(OETagDictionary::TheOETagDictionary(), nullptr);
}

// Every row both ways: its name (either case mode) finds it, its id finds it and names it.
TEST(TagDictionary, EveryRowFoundByNameInBothCaseModesAndById) {
    OETagDictionary* d = OETagDictionary::TheOETagDictionary();
    ASSERT_NE(d, nullptr);
    const OETagDictionaryEntry* table = GetOETagDictionary();
    for (unsigned short i = 0; i < NumberOfOEDictionaryEntry(); ++i) {
        std::string name = table[i].m_name;
        if (name.empty()) continue;
        std::string lower = name;
        for (char& c : lower) c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
        unsigned short n = static_cast<unsigned short>(name.size());
        OETagID id = OETAG_NONE;
        EXPECT_EQ(d->GetTagID(name.c_str(), n, &id, OECaseSensitive), &table[i]) << name;
        EXPECT_EQ(d->GetTagID(lower.c_str(), n, &id, OECaseInsensitive), &table[i]) << name;
        EXPECT_EQ(id, table[i].m_id);
        EXPECT_EQ(d->FindDictionaryEntry(table[i].m_id), &table[i]) << name;
        EXPECT_STREQ(d->GetTagString(table[i].m_id), table[i].m_name);
    }
}

TEST(TagDictionary, MixedCaseCustomTableUsesTheFoldedSearch) {
    static const OETagDictionaryEntry mixed[] = {{static_cast<OETagID>(1), "Abc"},
                                                 {static_cast<OETagID>(2), "XY"}};
    TagDictionary d(mixed, 2);
    OETagID id = OETAG_NONE;
    EXPECT_EQ(d.GetTagID("ABC", 3, &id, OECaseSensitive), nullptr);
    EXPECT_EQ(d.GetTagID("ABC", 3, &id, OECaseInsensitive), &mixed[0]);
    EXPECT_EQ(d.GetTagID("xy", 2, &id, OECaseInsensitive), &mixed[1]);
}
