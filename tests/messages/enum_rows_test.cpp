// White-box: how an aggregate writes its enumeration rows. The descriptor index resolves, once per
// row, which of the builder's value writers a row's keyword table belongs to; a row is then
// written through that writer (so a builder subclass that overrides it sees every such element)
// or, for tables without one, as its keyword. The test class has one row per table, placed after
// sixty absent rows so that the rows straddle the index's first and second 64-row words, and a
// valid table in the reverse order of the field rows (the build order must still be the rows').
#include "msg_helpers.h"

#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

namespace {

struct Kind {
    OETagID tag;
    const OEKeywordTable* table;
    const char* writer; // the builder writer the row goes through; null: the keyword as it is
};

const Kind kKinds[] = {
    {OETAG_TRNTYPE, &OEKW_BANKTXTYPE, "AddBankTxType"},
    {OETAG_CORRECTACTION, &OEKW_CORRECTACTION, "AddBankAction"},
    {OETAG_ACCTTYPE, &OEKW_BANKACCOUNTTYPE, "AddBankAccountType"},
    {OETAG_OFXSEC, &OEKW_OFXSECURITY, "AddOFXSecurity"},
    {OETAG_SYNCMODE, &OEKW_SYNCMODE, "AddSyncMode"},
    {OETAG_CHARTYPE, &OEKW_CHARTYPE, "AddCharacterType"},
    {OETAG_CLIENTROUTING, &OEKW_CLIENTROUTING, "AddClientRouting"},
    {OETAG_BALTYPE, &OEKW_BALTYPE, "AddBalType"},
    {OETAG_ASSETCLASS, &OEKW_ASSETCLASS, "AddAssetClass"},
    {OETAG_DEBTTYPE, &OEKW_DEBTTYPE, "AddDebtType"},
    {OETAG_DEBTCLASS, &OEKW_DEBTCLASS, "AddDebtClass"},
    {OETAG_CALLTYPE, &OEKW_CALLTYPE, "AddCallType"},
    {OETAG_MFTYPE, &OEKW_MFTYPE, "AddMFType"},
    {OETAG_STOCKTYPE, &OEKW_STOCKTYPE, "AddStockType"},
    {OETAG_SEVERITY, &OEKW_SEVERITY, nullptr},
};
const unsigned kKindCount = sizeof(kKinds) / sizeof(kKinds[0]);
const unsigned kAbsent = 60;
const unsigned kRows = kAbsent + kKindCount;

class AllEnums : public OEAggregate {
public:
    explicit AllEnums(bool rowByRow) : OEAggregate(1), m_rowByRow(rowByRow) { SetType(OETAG_STMTTRN); }
    const OEAggregateDesc& Describe() const override;
    // Row by row through BuildRow, as a subclass that writes between rows does.
    int Build(OEBuilder* builder) override {
        if (!m_rowByRow) return OEAggregate::Build(builder);
        const OEAggregateDesc& d = Describe();
        for (unsigned short i = 0; i < d.m_fieldCount; ++i)
            if (OEBuildStatus s = BuildRow(builder, &d.m_fields[i])) return s;
        return OEBS_OK;
    }
    unsigned short Set(OETagID tag, unsigned long value) { return SetNumber(tag, value); }

    bool m_rowByRow;
    unsigned short m_values[kKindCount] = {};
    OEString m_absent;
};

template <unsigned I> void* ValueSlot(OEDataObj* o) {
    return &static_cast<AllEnums*>(o)->m_values[I];
}

template <unsigned... I> std::vector<OEFieldRow> MakeFields(std::integer_sequence<unsigned, I...>) {
    std::vector<OEFieldRow> rows;
    for (unsigned i = 0; i < kAbsent; ++i)
        rows.push_back({static_cast<OETagID>(900 + i), OEFK_TEXT,
                        [](OEDataObj* o) -> void* { return &static_cast<AllEnums*>(o)->m_absent; }, nullptr,
                        nullptr});
    for (const OEFieldRow& row :
         {OEFieldRow{kKinds[I].tag, OEFK_ENUM, &ValueSlot<I>, kKinds[I].table, nullptr}...})
        rows.push_back(row);
    return rows;
}

const std::vector<OEFieldRow> kFields = MakeFields(std::make_integer_sequence<unsigned, kKindCount>());
const std::vector<OETagRow> kValid = [] {
    std::vector<OETagRow> valid;
    for (unsigned i = kRows; i-- > 0;) valid.push_back({kFields[i].m_tag, OEVM_ALL, 0});
    return valid;
}();
const OEAggregateDesc kDesc{OETAG_STMTTRN,
                            kValid.data(),
                            static_cast<unsigned short>(kValid.size()),
                            kValid.data(),
                            0,
                            kFields.data(),
                            static_cast<unsigned short>(kFields.size())};
const OEAggregateDesc& AllEnums::Describe() const {
    return kDesc;
}

// Every enumeration writer a row may go through, marked after the keyword.
class Marking : public OEBuilder {
public:
    explicit Marking(unsigned short endTags) : OEBuilder(OEBCL_LF, endTags) {}
#define MARK(Writer, Param)                                                                                  \
    OEBuildStatus Writer(Param value) override {                                                             \
        OEBuildStatus s = OEBuilder::Writer(value);                                                          \
        GetBuffer()->WriteLarge("!" #Writer "\n", sizeof("!" #Writer "\n") - 1);                             \
        return s;                                                                                            \
    }
    MARK(AddBankTxType, OEBankTxType)
    MARK(AddBankAction, OEBankAction)
    MARK(AddBankAccountType, OEBankAccountType)
    MARK(AddOFXSecurity, OEOFXSecurity)
    MARK(AddSyncMode, OESyncMode)
    MARK(AddCharacterType, OECharacterType)
    MARK(AddClientRouting, OEClientRouting)
    MARK(AddBalType, const OEBalType&)
    MARK(AddAssetClass, const OEAssetClass&)
    MARK(AddDebtType, const OEDebtType&)
    MARK(AddDebtClass, const OEDebtClass&)
    MARK(AddCallType, const OECallType&)
    MARK(AddMFType, const OEMFType&)
    MARK(AddStockType, const OEStockType&)
#undef MARK
};

TEST(EnumRows, EachRowGoesThroughItsTablesWriterInRowOrder) {
    OETagDictionary* dictionary = OETagDictionary::TheOETagDictionary();
    for (unsigned short endTags = 0; endTags < 2; ++endTags) {
        for (bool rowByRow : {false, true}) {
            SCOPED_TRACE(std::string(endTags ? "xml" : "sgml") + (rowByRow ? ", row by row" : ""));
            AllEnums all(rowByRow);
            std::string expected;
            for (const Kind& k : kKinds) {
                // The last keyword of each table, so that a writer of the wrong table cannot match.
                const unsigned short value = static_cast<unsigned short>(k.table->m_count - 1);
                ASSERT_EQ(all.Set(k.tag, value), 1);
                const std::string name = dictionary->GetTagString(k.tag);
                expected += "<" + name + ">" + k.table->m_words[value] + "\n";
                if (k.writer) expected += std::string("!") + k.writer + "\n";
                if (endTags) expected += "</" + name + ">\n";
            }
            OEBuffer buffer(0, 4096);
            Marking builder(endTags);
            ASSERT_EQ(builder.Build(&buffer, &all, OEBSO_STRICT, 0, 0), OEBS_OK);
            EXPECT_EQ(std::string(buffer.GetBufferPtr(), buffer.GetBufferSize()), expected);
        }
    }
}

TEST(EnumRows, AValueWithoutKeywordFailsInTheAggregate) {
    AllEnums all(false);
    ASSERT_EQ(all.Set(OETAG_SYNCMODE, 1), 1);
    ASSERT_EQ(all.Set(OETAG_MFTYPE, 0), 1);
    all.m_values[12] = 7; // MFTYPE's member, out of its three keywords
    OEBuffer buffer(0, 4096);
    Marking builder(0);
    EXPECT_EQ(builder.Build(&buffer, &all, OEBSO_STRICT, 0, 0), OEBS_NOTEXTFORM);
    EXPECT_EQ(builder.GetFailedObject(), &all);
    EXPECT_EQ(std::string(buffer.GetBufferPtr(), buffer.GetBufferSize()), "<SYNCMODE>LITE\n!AddSyncMode\n")
        << "the rows before it stay written";
}

} // namespace
