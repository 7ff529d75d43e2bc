#include "alloc_failure.h"
#include "oesdk.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

TEST(OEBuffer, ConstructionRules) {
    struct Case {
        unsigned long initial, growBy, allocation, increment;
    };
    for (Case c : {Case{0, 0, 512, 512}, Case{0, 100, 100, 100}, Case{64, 0, 64, 0}, Case{64, 32, 64, 32}}) {
        OEBuffer b(c.initial, c.growBy);
        EXPECT_EQ(b.GetBufferAllocation(), c.allocation) << c.initial << "/" << c.growBy;
        EXPECT_EQ(b.GetGrowBy(), c.increment) << c.initial << "/" << c.growBy;
        EXPECT_EQ(b.GetBufferSize(), 0u);
    }
}

TEST(OEBuffer, WriteGrowsByMaxOfIncrementAndNeed) {
    OEBuffer b(4, 8);
    EXPECT_EQ(b.Write("abc", 3), OEBR_SUCCESS);
    EXPECT_EQ(b.GetBufferAllocation(), 4u);
    EXPECT_EQ(b.Write("de", 2), OEBR_SUCCESS); // needs 1 more: grows by the increment
    EXPECT_EQ(b.GetBufferAllocation(), 12u);
    std::string big(30, 'x');
    EXPECT_EQ(b.Write(big.data(), 30), OEBR_SUCCESS); // needs 23: grows by the need
    EXPECT_EQ(b.GetBufferAllocation(), 35u);
    EXPECT_EQ(b.GetBufferSize(), 35u);
    EXPECT_EQ(b.GetBufferOffset(), 35u);
}

TEST(OEBuffer, FixedBufferRefusesToGrow) {
    OEBuffer b(4, 0);
    EXPECT_EQ(b.Write("abcd", 4), OEBR_SUCCESS);
    EXPECT_EQ(b.Write('e'), OEBR_BEYONDEND);
    EXPECT_EQ(b.GetBufferSize(), 4u);
}

TEST(OEBuffer, WriteAtRewoundOffsetEndsTheData) {
    OEBuffer b;
    b.WriteString("hello world");
    b.SetBufferOffset(5);
    b.WriteString("!");
    EXPECT_EQ(b.GetBufferSize(), 6u);
    EXPECT_EQ(std::string(b.GetBufferPtr(), b.GetBufferSize()), "hello!");
}

TEST(OEBuffer, WriteLargeInPieces) {
    OEBuffer b;
    std::string data(40000, '\0');
    for (size_t i = 0; i < data.size(); ++i) data[i] = static_cast<char>('a' + i % 26);
    EXPECT_EQ(b.WriteLarge(data.data(), data.size()), OEBR_SUCCESS);
    EXPECT_EQ(b.GetBufferOffset(), 40000u);
    EXPECT_EQ(b.GetBufferSize(), 40000u);
    EXPECT_EQ(std::string(b.GetBufferPtr(), 40000), data);
    EXPECT_NE(b.GetSmallBufferPtr(), nullptr); // allocation still below 65535
    b.WriteLarge(data.data(), data.size());
    EXPECT_EQ(b.GetSmallBufferPtr(), nullptr);
    OEBuffer small;
    EXPECT_NE(small.GetSmallBufferPtr(), nullptr);
}

TEST(OEBuffer, WritesOfItsOwnBytesSurviveGrowth) {
    OEBuffer b(4, 4);
    b.WriteString("abcd");
    EXPECT_EQ(b.Write(&b), OEBR_SUCCESS); // the whole buffer appended to itself
    EXPECT_EQ(std::string(b.GetBufferPtr(), b.GetBufferSize()), "abcdabcd");
    EXPECT_EQ(b.Write(b.GetBufferPtr() + 1, 3), OEBR_SUCCESS); // grows: the source block moves
    EXPECT_EQ(std::string(b.GetBufferPtr(), b.GetBufferSize()), "abcdabcdbcd");
    std::string big(20000, 'q');
    b.WriteString(big.c_str());
    unsigned long size = b.GetBufferSize();
    EXPECT_EQ(b.WriteLarge(b.GetBufferPtr(), size), OEBR_SUCCESS); // in pieces, each growing
    EXPECT_EQ(b.GetBufferSize(), 2 * size);
    EXPECT_EQ(std::string(b.GetBufferPtr() + size, size), std::string(b.GetBufferPtr(), size));
}

TEST(OEBuffer, OffsetFarBeyondTheDataDoesNotWrap) {
    OEBuffer b;
    b.WriteString("abc");
    b.SetBufferOffset(0xFFFFFFFFul); // offset + count passes 32 bits
    char out[4] = {};
    unsigned short got = 9;
    EXPECT_EQ(b.Write("xy", 2), OEBR_BEYONDEND);
    EXPECT_EQ(b.Read(out, got, 2), OEBR_BEYONDEND);
    EXPECT_EQ(got, 0);
    EXPECT_EQ(b.GetBufferSize(), 3u);
}

TEST(OEBuffer, GetChOutsideTheDataIsZero) {
    OEBuffer b;
    b.WriteString("xyz");
    EXPECT_EQ(b.GetCh(-1), 0);
    EXPECT_EQ(b.GetCh(3), 0);
    EXPECT_EQ(b.GetCh(0), 'x');
    EXPECT_EQ(b.GetCh(2), 'z');
}

TEST(OEBuffer, FindSubChar) {
    OEBuffer b;
    b.Write("ab<cd", 5);
    b.Write('\0');
    b.Write("<z", 2);
    struct Case {
        unsigned long from;
        char ch;
        unsigned short found;
        unsigned long pos;
    };
    for (Case c : {Case{0, '<', 1, 2}, Case{2, '<', 1, 2}, Case{3, '<', 0, 5} /* NUL first */,
                   Case{5, '<', 0, 5} /* already NUL */, Case{6, '<', 1, 6}, Case{7, '<', 0, 8} /* end */,
                   Case{20, 'a', 0, 20}}) {
        unsigned long pos = 999;
        EXPECT_EQ(b.FindSubChar(c.from, c.ch, pos), c.found) << c.from;
        EXPECT_EQ(pos, c.pos) << c.from;
    }
}

TEST(OEBuffer, GetDataStopsAtNulOrEnd) {
    OEBuffer b;
    b.Write("abc", 3);
    b.Write('\0');
    b.Write("def", 3);
    OEString out;
    EXPECT_EQ(b.GetData(out, 0, 10), 3u);
    EXPECT_STREQ(out, "abc");
    EXPECT_EQ(b.GetData(out, 4, 10), 3u);
    EXPECT_STREQ(out, "def");
    EXPECT_EQ(b.GetData(out, 5, 1), 1u);
    EXPECT_STREQ(out, "e");
    EXPECT_EQ(b.GetData(out, 100, 1), 0u);
}

TEST(OEBuffer, ReadFixedCounts) {
    OEBuffer b;
    b.WriteString("abcdef");
    b.SetBufferOffset(0);
    char c = 0;
    EXPECT_EQ(b.Read(&c), OEBR_SUCCESS);
    EXPECT_EQ(c, 'a');
    char out[8] = {};
    unsigned short got = 99;
    EXPECT_EQ(b.Read(out, got, 3), OEBR_SUCCESS);
    EXPECT_EQ(got, 3);
    EXPECT_STREQ(out, "bcd");
    EXPECT_EQ(b.Read(out, got, 3), OEBR_BEYONDEND); // only two left: nothing copied
    EXPECT_EQ(got, 0);
    EXPECT_EQ(b.GetBufferOffset(), 4u);
}

TEST(OEBuffer, CompareCopyAndClear) {
    OEBuffer a, b;
    a.WriteString("same");
    b.WriteString("same");
    EXPECT_EQ(a.CompareBuffer(&b), 0);
    b.WriteString("+");
    EXPECT_LT(a.CompareBuffer(&b), 0);
    OEBuffer c;
    EXPECT_EQ(c.CopyBuffer(&b, 1, 3), OEBR_SUCCESS);
    EXPECT_EQ(std::string(c.GetBufferPtr(), c.GetBufferSize()), "ame");
    EXPECT_EQ(c.CopyBuffer(&b, 3, 10), OEBR_BEYONDEND);
    EXPECT_EQ(c.CopyBuffer(&c, 0, 3), OEBR_SUCCESS);
    EXPECT_EQ(std::string(c.GetBufferPtr(), c.GetBufferSize()), "ameame");
    c.ClearBuffer('#');
    EXPECT_EQ(c.GetBufferSize(), 0u);
    EXPECT_EQ(c.GetBufferOffset(), 0u);
    EXPECT_EQ(c.GetBufferPtr()[0], '#');
}

TEST(OEBuffer, GrowthFailureCodesAndNoBlockAfterwards) {
    OEThreadState::SetErrorCode(0);
    OEBuffer b(4, 4);
    b.Write("abcd", 4);
    {
        FailAllocations fail;
        EXPECT_EQ(b.Write('e'), OEBR_GROWFAILED);
    }
    EXPECT_EQ(OEThreadState::GetErrorCode(), 1u);
    EXPECT_EQ(b.GetBufferPtr(), nullptr);
    EXPECT_EQ(b.Write('e'), OEBR_NOBUFFER);
    OEThreadState::SetErrorCode(0);
    OEBuffer c(4, 4);
    FailAllocations fail;
    EXPECT_EQ(c.AllocateTo(100), OEBR_GROWFAILED);
    OEThreadState::SetErrorCode(0);
}
