// The data object base: presence bits tied to valid-table rows, required-tag checks, the parse
// protocol pieces that need no tokenizer, and the factory link and creation rule.
#include "oesdk.h"

#include <gtest/gtest.h>

#include <memory>
#include <vector>

namespace {

OETagRow R(OETagID tag, unsigned short mask = OEVM_ALL) {
    return OETagRow{tag, mask, 0};
}

// Valid rows: NAME, a version-2-only DESC, VALUE, a not-version-1 DTASOF, then 70 filler rows so
// that BALTYPE (row 74) and CURRENCY (row 75) sit in the third word.
class Sample : public OEDataObj {
public:
    explicit Sample(unsigned short version = 1) : OEDataObj(version) { SetType(OETAG_BAL); }
    unsigned short GetArrayOfValidTags(OEArrayOfTags& tags) const override {
        tags.Set(Valid().data(), static_cast<unsigned short>(Valid().size()));
        return 1;
    }
    unsigned short GetArrayOfRequiredTags(OEArrayOfTags& tags) const override {
        static const OETagRow required[] = {R(OETAG_NAME), R(OETAG_DESC, OEVM_V2), R(OETAG_VALUE),
                                            R(OETAG_BALTYPE), R(OETAG_MEMO)};
        tags.Set(required);
        return 1;
    }
    static const std::vector<OETagRow>& Valid() {
        static const std::vector<OETagRow> rows = [] {
            std::vector<OETagRow> v = {R(OETAG_NAME), R(OETAG_DESC, OEVM_V2), R(OETAG_VALUE),
                                       R(OETAG_DTASOF, OEVM_NOTV1)};
            for (unsigned id = 1000; v.size() < 74; ++id) v.push_back(R(static_cast<OETagID>(id)));
            v.push_back(R(OETAG_BALTYPE));
            v.push_back(R(OETAG_CURRENCY));
            return v;
        }();
        return rows;
    }
};

// This program runs with a host factory installed, so that no default factory is left behind for
// the leak checker (the library gives up owning its default on purpose, see below).
OEDataObjFactory g_hostFactory(1);
struct HostFactoryEnvironment : ::testing::Environment {
    void SetUp() override { OEDataObj::SetFactory(&g_hostFactory); }
    void TearDown() override { OEDataObj::SetFactory(nullptr); }
};
::testing::Environment* const g_environment = ::testing::AddGlobalTestEnvironment(new HostFactoryEnvironment);

// White-box view of the factory statics.
struct FactoryStatics : OEDataObj {
    static OEDataObjFactory* Installed() { return m_factoryObj; }
    static unsigned short Owned() { return m_factoryAllocated; }
};

} // namespace

TEST(DataObj, PresenceBitsFollowTableRows) {
    Sample v1(1);
    EXPECT_EQ(v1.SetTag(OETAG_NAME), 1);
    EXPECT_EQ(v1.SetTag(OETAG_DESC), 0); // row applies to version 2 only, but keeps its bit
    EXPECT_EQ(v1.SetTag(OETAG_VALUE), 1);
    EXPECT_EQ(v1.SetTag(OETAG_BALTYPE), 1);
    EXPECT_EQ(v1.SetTag(OETAG_MEMO), 0); // not a valid tag at all
    EXPECT_EQ(v1.GetPresentWord(0), 0x5u);
    EXPECT_EQ(v1.GetPresentWord(2), 1u << (74 - 64));
    EXPECT_EQ(v1.ValidateTag(OETAG_VALUE), 1);
    EXPECT_EQ(v1.ValidateTag(OETAG_CURRENCY), 0);

    Sample v2(2);
    EXPECT_EQ(v2.IsValidTag(OETAG_DTASOF), 1);
    EXPECT_EQ(v2.SetTag(OETAG_DESC), 1);
    EXPECT_EQ(v2.GetPresentWord(0), 0x2u);
    EXPECT_EQ(Sample(0).IsValidTag(OETAG_NAME), 0); // version 0 accepts nothing

    EXPECT_EQ(v1.ClearTag(OETAG_VALUE), 1);
    EXPECT_EQ(v1.ValidateTag(OETAG_VALUE), 0);
    OEParseLogger* log = OEParseLogger::TheOEParseLogger();
    log->DeleteAll();
    EXPECT_EQ(v1.ClearTag(OETAG_DESC), 0);
    ASSERT_EQ(log->GetNumberParseExceptions(), 1);
    EXPECT_EQ(log->GetParseException(0)->GetCode(), OEPW_UNKNOWNTAG);
    EXPECT_EQ(log->GetParseException(0)->GetTag(), OETAG_DESC);
    EXPECT_EQ(log->GetParseException(0)->GetObject(), &v1);
    log->DeleteAll();
}

TEST(DataObj, AnyAndOneValidPresent) {
    Sample s;
    EXPECT_EQ(s.AnyValidPresent(), 0);
    EXPECT_EQ(s.OneValidPresent(), 0);
    s.SetTag(OETAG_CURRENCY);
    EXPECT_EQ(s.AnyValidPresent(), 1);
    EXPECT_EQ(s.OneValidPresent(), 1);
    s.SetTag(OETAG_NAME);
    EXPECT_EQ(s.OneValidPresent(), 0);
}

TEST(DataObj, RequiredTags) {
    Sample s(1);
    EXPECT_EQ(s.IsTagRequired(OETAG_NAME), 1);
    EXPECT_EQ(s.IsTagRequired(OETAG_DESC), 0); // its row does not apply to version 1
    EXPECT_EQ(s.AllRequiredPresent(), 0);
    // Missing in row order: NAME, VALUE, BALTYPE, MEMO (MEMO is required but never valid).
    EXPECT_EQ(s.GetFirstMissingRequiredTag(OETAG_NONE), OETAG_NAME);
    EXPECT_EQ(s.GetFirstMissingRequiredTag(OETAG_NAME), OETAG_VALUE);
    EXPECT_EQ(s.GetFirstMissingRequiredTag(OETAG_BALTYPE), OETAG_MEMO);
    EXPECT_EQ(s.GetFirstMissingRequiredTag(OETAG_MEMO), OETAG_NONE);
    EXPECT_EQ(s.GetFirstMissingRequiredTag(OETAG_CURRENCY), OETAG_NONE); // never met on the walk
    s.SetTag(OETAG_NAME);
    s.SetTag(OETAG_VALUE);
    s.SetTag(OETAG_BALTYPE);
    EXPECT_EQ(s.GetFirstMissingRequiredTag(OETAG_NAME), OETAG_NONE); // NAME is not missing
    EXPECT_EQ(s.AllRequiredPresent(), 0);                            // MEMO can never be present
    EXPECT_EQ(OEDataObj(1).AllRequiredPresent(), 1);                 // no required table
}

TEST(DataObj, VersionFromTagAndBaseMembers) {
    struct Case {
        OETagID type;
        unsigned short version;
    } cases[] = {{OETAG_BANKMSGSRSV1, 1}, {OETAG_BANKMSGSRQV2, 2}, {OETAG_OFX, 0}, {OETAG_NONE, 0}};
    for (const auto& c : cases) {
        OEDataObj o;
        o.SetType(c.type);
        EXPECT_EQ(o.GetMsgSetVersionFromTag(), c.version) << c.type;
    }
    Sample a(2), b(1);
    a.SetTag(OETAG_DESC);
    EXPECT_EQ(b.CopyBaseMembersFrom(&a), 1);
    EXPECT_EQ(b.GetMsgSetVersion(), 2);
    EXPECT_EQ(b.ValidateTag(OETAG_DESC), 1);
    EXPECT_EQ(b.GetType(), OETAG_BAL);
}

TEST(DataObj, ProtocolWithoutParser) {
    Sample parent(2);
    OEDataObj* child = new OEDataObj;
    EXPECT_EQ(parent.PushAndSetObject(nullptr, OETAG_CURRENCY), OEPS_NORESOURCE);
    EXPECT_EQ(parent.PushAndSetObject(child, OETAG_MEMO), OEPS_INVALID);
    EXPECT_EQ(parent.PushAndSetObject(child, OETAG_CURRENCY), OEPS_NORESOURCE); // no parser
    EXPECT_EQ(child->GetType(), OETAG_CURRENCY);
    EXPECT_EQ(child->GetMsgSetVersion(), 2);
    EXPECT_EQ(parent.ValidateTag(OETAG_CURRENCY), 1);
    delete child;

    OETagDictionaryEntry name{OETAG_NAME, "NAME"};
    EXPECT_EQ(parent.HandleTagStart(&name), OEPS_INVALID);
    EXPECT_EQ(parent.HandleTagElement(&name, "x"), OEPS_INVALID); // neither form overridden
    EXPECT_EQ(parent.HandleTagEnd(&name), OEPS_NORESOURCE);
}

TEST(DataObj, EndTagOfAnotherAggregate) {
    OEParser parser;
    Sample root(1), child(1);
    parser.Parse(nullptr, &root, 0, 0);
    ASSERT_EQ(parser.PushObject(&child), 1);
    OEParseLogger::TheOEParseLogger()->DeleteAll();
    OETagDictionaryEntry other{OETAG_STMTRS, "STMTRS"}, own{OETAG_BAL, "BAL"};
    EXPECT_EQ(child.HandleTagEnd(&other), OEPS_BADENDTAG);
    EXPECT_EQ(OEParseLogger::TheOEParseLogger()->GetParseException(0)->GetCode(), OEPW_INVALIDENDAGG);
    EXPECT_EQ(child.HandleTagEnd(&own), OEPS_OK);
    EXPECT_EQ(parser.GetCurrentObject(), &root);
    EXPECT_EQ(parser.GetDepth(), 0);
    OEParseLogger::TheOEParseLogger()->DeleteAll();
}

TEST(DataObjFactory, CreationRuleAndFailures) {
    OEDataObjFactory v2(2);
    std::unique_ptr<OEDataObj> a(v2.NewDataObj(0)), b(v2.NewDataObj(1));
    EXPECT_EQ(a->GetMsgSetVersion(), 2);
    EXPECT_EQ(b->GetMsgSetVersion(), 1);

    OEMemory::FailureHook old = OEMemory::SetFailureHook([](std::size_t) { return 1; });
    OEThreadState::SetErrorCode(0);
    OEDataObj* failed = v2.NewDataObj(0);
    OEMemory::SetFailureHook(old);
    EXPECT_EQ(failed, nullptr);
    EXPECT_EQ(OEThreadState::GetErrorCode(), 1ul);
    OEThreadState::SetErrorCode(0);
}

TEST(DataObjFactory, InstallationAndOwnership) {
    OEDataObj::SetFactory(nullptr);
    OEDataObjFactory* made = OEDataObj::GetFactory();
    ASSERT_NE(made, nullptr);
    EXPECT_EQ(OEDataObj::GetFactory(), made);
    EXPECT_EQ(made->GetVersion(), 1);
    EXPECT_EQ(FactoryStatics::Owned(), 1);
    {
        OEDataObj any; // every constructor gives up the library's ownership
        EXPECT_EQ(FactoryStatics::Owned(), 0);
    }
    EXPECT_EQ(FactoryStatics::Installed(), made); // so destroying an object did not free it
    OEDataObj::SetFactory(nullptr);               // nor does replacing it: it is the caller's now
    delete made;

    // Destroying an object while the library owns its factory frees it and clears the statics.
    OEDataObj* early = new OEDataObj;
    ASSERT_NE(OEDataObj::GetFactory(), nullptr);
    delete early;
    EXPECT_EQ(FactoryStatics::Installed(), nullptr);

    OEDataObjFactory host(2);
    OEDataObj::GetFactory();                    // a library-owned default again...
    EXPECT_EQ(OEDataObj::SetFactory(&host), 1); // ...deleted here (the sanitizer build checks once)
    EXPECT_EQ(OEDataObj::GetFactory(), &host);
    EXPECT_EQ(FactoryStatics::Owned(), 0);
    OEDataObjFactory other(1);
    OEDataObj::SetFactory(&other); // a host factory is never deleted by the library
    EXPECT_EQ(host.GetVersion(), 2);
    OEDataObj::SetFactory(&g_hostFactory);
}

TEST(MIMEHeader, ValueSemantics) {
    OEMIMEHeader h("Content-Type", "application/x-ofx");
    OEMIMEHeader copy(h), assigned;
    assigned = h;
    EXPECT_STREQ(copy.GetName(), "Content-Type");
    EXPECT_STREQ(assigned.GetValue(), "application/x-ofx");
    EXPECT_EQ(h.HasName("content-type"), 1);
    EXPECT_EQ(h.HasName("content-length"), 0);
    EXPECT_EQ(h.SetValue(OEString("")), 1);
    EXPECT_TRUE(h.GetValue().IsEmpty());
    EXPECT_EQ(assigned.DeepCopyFrom(&h), 1);
    EXPECT_TRUE(assigned.GetValue().IsEmpty());
}
