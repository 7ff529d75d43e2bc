#include "messages/oemsgset.h"

#include "build/oebuilder.h"
#include "foundation/oeparsewarning.h"
#include "foundation/oethread.h"

#include <cstring>
#include <string>
#include <vector>

namespace {

// Every message set (request side), its wrapper tags and its children in build order. The
// response side is the same with RS for RQ, except where noted.
struct Family {
    OETagID m_v1, m_v2; // m_v2 is 0 for a set that exists only as V1
    std::vector<OETagID> m_rq;
    std::vector<OETagID> m_rsExtra; // response-only children, appended after the mirrored ones
};

const std::vector<Family>& Families() {
    static const std::vector<Family> families = {
        {OETAG_SIGNONMSGSRQV1,
         OETAG_SIGNONMSGSRQV2,
         {OETAG_SONRQ, OETAG_PINCHTRNRQ, OETAG_CHALLENGETRNRQ},
         {}},
        {OETAG_SIGNUPMSGSRQV1,
         OETAG_SIGNUPMSGSRQV2,
         {OETAG_ENROLLTRNRQ, OETAG_ACCTINFOTRNRQ, OETAG_CHGUSERINFOTRNRQ, OETAG_CHGUSERINFOSYNCRQ,
          OETAG_ACCTTRNRQ, OETAG_ACCTSYNCRQ},
         {}},
        {OETAG_BANKMSGSRQV1,
         OETAG_BANKMSGSRQV2,
         {OETAG_STMTTRNRQ, OETAG_STMTENDTRNRQ, OETAG_INTRATRNRQ, OETAG_RECINTRATRNRQ, OETAG_STPCHKTRNRQ,
          OETAG_BANKMAILTRNRQ, OETAG_BANKMAILSYNCRQ, OETAG_STPCHKSYNCRQ, OETAG_INTRASYNCRQ,
          OETAG_RECINTRASYNCRQ},
         {}},
        {OETAG_CREDITCARDMSGSRQV1, OETAG_CREDITCARDMSGSRQV2, {OETAG_CCSTMTTRNRQ, OETAG_CCSTMTENDTRNRQ}, {}},
        {OETAG_INVSTMTMSGSRQV1,
         OETAG_INVSTMTMSGSRQV2,
         {OETAG_INVSTMTTRNRQ, OETAG_INVMAILTRNRQ, OETAG_INVMAILSYNCRQ},
         {}},
        {OETAG_INTERXFERMSGSRQV1,
         OETAG_INTERXFERMSGSRQV2,
         {OETAG_INTERTRNRQ, OETAG_MULTIINTERTRNRQ, OETAG_RECINTERTRNRQ, OETAG_INTERSYNCRQ,
          OETAG_RECINTERSYNCRQ},
         {}},
        {OETAG_WIREXFERMSGSRQV1, OETAG_WIREXFERMSGSRQV2, {OETAG_WIRETRNRQ, OETAG_WIRESYNCRQ}, {}},
        {OETAG_BILLPAYMSGSRQV1,
         OETAG_BILLPAYMSGSRQV2,
         {OETAG_PAYEETRNRQ, OETAG_PAYEESYNCRQ, OETAG_PMTTRNRQ, OETAG_RECPMTTRNRQ, OETAG_PMTINQTRNRQ,
          OETAG_PMTMAILTRNRQ, OETAG_PMTSYNCRQ, OETAG_RECPMTSYNCRQ, OETAG_PMTMAILSYNCRQ},
         {}},
        {OETAG_EMAILMSGSRQV1,
         OETAG_EMAILMSGSRQV2,
         {OETAG_MAILTRNRQ, OETAG_MAILSYNCRQ, OETAG_GETMIMETRNRQ},
         {}},
        // The response side's SECLIST follows its wrappers.
        {OETAG_SECLISTMSGSRQV1, OETAG_SECLISTMSGSRQV2, {OETAG_SECLISTTRNRQ}, {OETAG_SECLIST}},
        {OETAG_PROFMSGSRQV1, OETAG_PROFMSGSRQV2, {OETAG_PROFTRNRQ}, {}},
        {OETAG_KEST_BRANDMSGSRQV1,
         OETAG_KEST_BRANDMSGSRQV2,
         {OETAG_KEST_BRANDTRNRQ, OETAG_KEST_MKTTIERTRNRQ},
         {}},
        {OETAG_KEST_SWREGMSGSRQV1, OETAG_KEST_SWREGMSGSRQV2, {OETAG_KEST_SWREGTRNRQ}, {}},
        {OETAG_KEST_CLOGMSGSRQV1, OETAG_KEST_CLOGMSGSRQV2, {OETAG_KEST_CLIENTLOGTRNRQ}, {}},
        {OETAG_KEST_SURVEYMSGSRQV1, OETAG_KEST_SURVEYMSGSRQV2, {OETAG_KEST_SURVEYTRNRQ}, {}},
        {OETAG_KEST_USLFIMSGSRQV1, OETAG_KEST_USLFIMSGSRQV2, {OETAG_KEST_FIUSAGELOGTRNRQ}, {}},
        {OETAG_KEST_USLCUMSGSRQV1, OETAG_KEST_USLCUMSGSRQV2, {OETAG_KEST_CUUSAGELOGTRNRQ}, {}},
        {OETAG_K_PAYROLLMSGSRQV1, OETAG_NONE, {OETAG_K_PAYROLLUPDATERQ, OETAG_K_PAYROLLENROLLTRNRQ}, {}},
        {OETAG_K_EFILEMSGSRQV1, OETAG_NONE, {OETAG_K_EFILESYNCRQ}, {OETAG_K_EFILETRNRS}},
    };
    return families;
}

// A new transaction wrapper for a tag: the multiple interbank wrappers have classes of their own,
// every other tag gets the plain wrapper.
OEDataObj* NewWrapper(OEDataObjFactory* factory, bool request, OETagID tag, unsigned short version) {
    if (request)
        return tag == OETAG_MULTIINTERTRNRQ ? static_cast<OEDataObj*>(factory->NewMultiTransRq(version))
                                            : static_cast<OEDataObj*>(factory->NewTransRq(version));
    return tag == OETAG_MULTIINTERTRNRS ? static_cast<OEDataObj*>(factory->NewMultiTransRs(version))
                                        : static_cast<OEDataObj*>(factory->NewTransRs(version));
}

// The valid rows of each wrapper, both sides, built once from the families.
struct WrapperTables {
    OETagID m_wrapper;
    std::vector<OETagRow> m_rows;
};

const std::vector<WrapperTables>& Tables() {
    static const std::vector<WrapperTables> tables = [] {
        std::vector<WrapperTables> out;
        for (const Family& f : Families()) {
            for (OETagID w : {f.m_v1, f.m_v2}) {
                if (w == OETAG_NONE) continue;
                WrapperTables rq{w, {}}, rs{OEResponseTagOf(w), {}};
                for (OETagID t : f.m_rq) {
                    rq.m_rows.push_back(OETagRow{t, OEVM_ALL, 0});
                    OETagID r = OEResponseTagOf(t);
                    if (r) rs.m_rows.push_back(OETagRow{r, OEVM_ALL, 0});
                }
                for (OETagID t : f.m_rsExtra) rs.m_rows.push_back(OETagRow{t, OEVM_ALL, 0});
                out.push_back(rq);
                out.push_back(rs);
            }
        }
        return out;
    }();
    return tables;
}

const WrapperTables* TablesOf(OETagID wrapper) {
    for (const WrapperTables& t : Tables())
        if (t.m_wrapper == wrapper) return &t;
    return nullptr;
}

bool IsSyncTag(OETagID tag) {
    if (tag == OETAG_K_PAYROLLUPDATERQ) return true; // an update request travels with the syncs
    OETagDictionary* d = OETagDictionary::TheOETagDictionary();
    const char* name = d ? d->GetTagString(tag) : nullptr;
    size_t n = name ? std::strlen(name) : 0;
    return n > 6 && (std::strcmp(name + n - 6, "SYNCRQ") == 0 || std::strcmp(name + n - 6, "SYNCRS") == 0);
}

// The root's valid rows: the wrappers with their version masks (the e-file wrapper carries the
// all-versions mask, deliberately).
const OETagRow kRootRqValid[] = {
    {OETAG_SIGNUPMSGSRQV1, OEVM_V1, 0},      {OETAG_SIGNUPMSGSRQV2, OEVM_V2, 0},
    {OETAG_BANKMSGSRQV1, OEVM_V1, 0},        {OETAG_BANKMSGSRQV2, OEVM_V2, 0},
    {OETAG_CREDITCARDMSGSRQV1, OEVM_V1, 0},  {OETAG_CREDITCARDMSGSRQV2, OEVM_V2, 0},
    {OETAG_INVSTMTMSGSRQV1, OEVM_V1, 0},     {OETAG_SECLISTMSGSRQV1, OEVM_V1, 0},
    {OETAG_INVSTMTMSGSRQV2, OEVM_V2, 0},     {OETAG_SECLISTMSGSRQV2, OEVM_V2, 0},
    {OETAG_INTERXFERMSGSRQV1, OEVM_V1, 0},   {OETAG_INTERXFERMSGSRQV2, OEVM_V2, 0},
    {OETAG_WIREXFERMSGSRQV1, OEVM_V1, 0},    {OETAG_WIREXFERMSGSRQV2, OEVM_V2, 0},
    {OETAG_BILLPAYMSGSRQV1, OEVM_V1, 0},     {OETAG_BILLPAYMSGSRQV2, OEVM_V2, 0},
    {OETAG_EMAILMSGSRQV1, OEVM_V1, 0},       {OETAG_EMAILMSGSRQV2, OEVM_V2, 0},
    {OETAG_KEST_BRANDMSGSRQV1, OEVM_V1, 0},  {OETAG_KEST_BRANDMSGSRQV2, OEVM_V2, 0},
    {OETAG_KEST_SWREGMSGSRQV1, OEVM_V1, 0},  {OETAG_KEST_SWREGMSGSRQV2, OEVM_V2, 0},
    {OETAG_KEST_CLOGMSGSRQV1, OEVM_V1, 0},   {OETAG_KEST_CLOGMSGSRQV2, OEVM_V2, 0},
    {OETAG_KEST_SURVEYMSGSRQV1, OEVM_V1, 0}, {OETAG_KEST_SURVEYMSGSRQV2, OEVM_V2, 0},
    {OETAG_KEST_USLFIMSGSRQV1, OEVM_V1, 0},  {OETAG_KEST_USLFIMSGSRQV2, OEVM_V2, 0},
    {OETAG_KEST_USLCUMSGSRQV1, OEVM_V1, 0},  {OETAG_KEST_USLCUMSGSRQV2, OEVM_V2, 0},
    {OETAG_K_PAYROLLMSGSRQV1, OEVM_V1, 0},   {OETAG_K_EFILEMSGSRQV1, OEVM_ALL, 0},
    {OETAG_SIGNONMSGSRQV1, OEVM_V1, 0},      {OETAG_SIGNONMSGSRQV2, OEVM_V2, 0},
    {OETAG_PROFMSGSRQV1, OEVM_V1, 0},        {OETAG_PROFMSGSRQV2, OEVM_V2, 0}};

const std::vector<OETagRow>& RootRsValid() {
    static const std::vector<OETagRow> rows = [] {
        std::vector<OETagRow> out;
        for (const OETagRow& r : kRootRqValid)
            out.push_back(OETagRow{OEResponseTagOf(r.m_tag), r.m_versionMask, 0});
        return out;
    }();
    return rows;
}

// The fixed build order of the roots: sign-on first, the security list after e-mail.
const OETagID kRootBuildOrder[] = {
    OETAG_SIGNONMSGSRQV1,      OETAG_SIGNONMSGSRQV2,      OETAG_SIGNUPMSGSRQV1,     OETAG_SIGNUPMSGSRQV2,
    OETAG_BANKMSGSRQV1,        OETAG_BANKMSGSRQV2,        OETAG_CREDITCARDMSGSRQV1, OETAG_CREDITCARDMSGSRQV2,
    OETAG_INVSTMTMSGSRQV1,     OETAG_INVSTMTMSGSRQV2,     OETAG_INTERXFERMSGSRQV1,  OETAG_INTERXFERMSGSRQV2,
    OETAG_WIREXFERMSGSRQV1,    OETAG_WIREXFERMSGSRQV2,    OETAG_BILLPAYMSGSRQV1,    OETAG_BILLPAYMSGSRQV2,
    OETAG_EMAILMSGSRQV1,       OETAG_EMAILMSGSRQV2,       OETAG_SECLISTMSGSRQV1,    OETAG_SECLISTMSGSRQV2,
    OETAG_PROFMSGSRQV1,        OETAG_PROFMSGSRQV2,        OETAG_KEST_BRANDMSGSRQV1, OETAG_KEST_BRANDMSGSRQV2,
    OETAG_KEST_SWREGMSGSRQV1,  OETAG_KEST_SWREGMSGSRQV2,  OETAG_KEST_CLOGMSGSRQV1,  OETAG_KEST_CLOGMSGSRQV2,
    OETAG_KEST_SURVEYMSGSRQV1, OETAG_KEST_SURVEYMSGSRQV2, OETAG_KEST_USLFIMSGSRQV1, OETAG_KEST_USLFIMSGSRQV2,
    OETAG_KEST_USLCUMSGSRQV1,  OETAG_KEST_USLCUMSGSRQV2,  OETAG_K_PAYROLLMSGSRQV1,  OETAG_K_EFILEMSGSRQV1};

// Copies the tree of one child into an object of its class (sign-on, transaction wrapper or sync).
template <class T> unsigned short CopyEntry(T* to, const OEDataObj* from) {
    return to->DeepCopyFrom(static_cast<const T*>(from));
}

} // namespace

// ================================================================ message sets

OEMessageSetBase::OEMessageSetBase(unsigned short version, bool request)
    : OEDataObj(version), m_request(request), m_trans(1, 5), m_sync(1, 5), m_signOn(nullptr),
      m_secList(nullptr) {}

OEMessageSetBase::~OEMessageSetBase() {
    delete m_signOn;
    delete m_secList;
}

unsigned short OEMessageSetBase::GetArrayOfValidTags(OEArrayOfTags& tags) const {
    const WrapperTables* t = TablesOf(GetType());
    if (!t) {
        tags.Set(nullptr, 0);
        return 1;
    }
    tags.Set(t->m_rows.data(), static_cast<unsigned short>(t->m_rows.size()));
    return 1;
}

unsigned short OEMessageSetBase::SetFactory(OEDataObjFactory* factory) {
    if (!factory) return 0;
    return OEDataObj::SetFactory(factory);
}

OEDataObj* OEMessageSetBase::GetChild(unsigned short index) const {
    if (m_signOn) {
        if (index == 0) return m_signOn;
        --index;
    }
    if (index < m_trans.Entries()) return m_trans.Get(index);
    index = static_cast<unsigned short>(index - m_trans.Entries());
    if (index < m_sync.Entries()) return m_sync.Get(index);
    return index == m_sync.Entries() ? m_secList : nullptr;
}

unsigned short OEMessageSetBase::GetNumberOfChildren() const {
    return static_cast<unsigned short>((m_signOn ? 1 : 0) + m_trans.Entries() + m_sync.Entries() +
                                       (m_secList ? 1 : 0));
}

OEParseStatus OEMessageSetBase::HandleTagStart(const OETagDictionaryEntry* entry) {
    if (!entry) return OEPS_INVALID;
    OETagID tag = entry->m_id;
    if (tag == SignOnTag()) return PushSingle(entry);
    const WrapperTables* t = TablesOf(GetType());
    bool listed = false;
    if (t)
        for (const OETagRow& r : t->m_rows) listed = listed || r.m_tag == tag;
    if (!listed) return OEPS_INVALID;
    if (tag == OETAG_SECLIST) return PushSingle(entry); // listed on the response side only
    return IsSyncTag(tag) ? PushSyncObject(tag) : PushTranObject(tag);
}

OEParseStatus OEMessageSetBase::PushSingle(const OETagDictionaryEntry* entry) {
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return OEPS_NORESOURCE;
    bool secList = entry->m_id == OETAG_SECLIST;
    OEDataObj*& slot = secList ? m_secList : m_signOn;
    if (slot) {
        OELogParseWarning(OEPW_EXTRAAGG, "", "", entry->m_id, this);
        delete slot;
        slot = nullptr;
    }
    unsigned short v = GetMsgSetVersion();
    slot = secList ? factory->NewSecList(v) : NewSignOn(factory, v);
    if (!slot) return OEPS_NORESOURCE;
    return PushAndSetObject(slot, entry->m_id);
}

OEDataObj* OEMessageSetBase::NewSignOn(OEDataObjFactory* factory, unsigned short version) const {
    return m_request ? static_cast<OEDataObj*>(factory->NewSignOnRq(version))
                     : static_cast<OEDataObj*>(factory->NewSignOnRs(version));
}

unsigned short OEMessageSetBase::StoreSignOn(OEDataObj* signOn) {
    if (m_signOn != signOn) delete m_signOn;
    if (!signOn) ClearTag(SignOnTag());
    m_signOn = signOn;
    SetTag(SignOnTag());
    return 1;
}

OEParseStatus OEMessageSetBase::PushSyncObject(OETagID tag) {
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return OEPS_NORESOURCE;
    OEDataObj* sync = m_request ? static_cast<OEDataObj*>(factory->NewSyncRq(GetMsgSetVersion()))
                                : static_cast<OEDataObj*>(factory->NewSyncRs(GetMsgSetVersion()));
    if (sync) {
        sync->SetType(tag);
        if (m_request)
            static_cast<OESyncRq*>(sync)->SetMsgsRqTag(GetType());
        else
            static_cast<OESyncRs*>(sync)->SetMsgsRsTag(GetType());
    }
    return OEAggregate::AdoptListChild(this, m_sync, sync, tag);
}

OEParseStatus OEMessageSetBase::PushTranObject(OETagID tag) {
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return OEPS_NORESOURCE;
    OEDataObj* trans = NewWrapper(factory, m_request, tag, GetMsgSetVersion());
    if (trans) {
        trans->SetType(tag);
        if (m_request)
            static_cast<OETransRq*>(trans)->SetMsgsRqTag(GetType());
        else
            static_cast<OETransRs*>(trans)->SetMsgsRsTag(GetType());
    }
    return OEAggregate::AdoptListChild(this, m_trans, trans, tag);
}

unsigned short OEMessageSetBase::StoreTrans(unsigned short index, OEDataObj* trans, bool append) {
    if (!trans) return 0;
    if (append) index = m_trans.Entries();
    if (index > m_trans.Entries()) return 0;
    if (!m_trans.Set(index, trans)) return 0;
    if (GetMsgSetVersion()) trans->SetMsgSetVersion(GetMsgSetVersion());
    if (trans->GetType()) SetTag(trans->GetType());
    return 1;
}

unsigned short OEMessageSetBase::StoreSync(unsigned short index, OEDataObj* sync, bool append) {
    if (!sync) return 0;
    if (append) index = m_sync.Entries();
    if (index > m_sync.Entries()) return 0;
    if (!m_sync.Set(index, sync)) return 0;
    // The set's version goes to the object and to each of its own children.
    unsigned short version = GetMsgSetVersion();
    sync->SetMsgSetVersion(version);
    for (unsigned short i = 0; i < sync->GetNumberOfChildren(); ++i)
        if (OEDataObj* child = sync->GetChild(i)) child->SetMsgSetVersion(version);
    SetTag(sync->GetType());
    return 1;
}

OEDataObj* OEMessageSetBase::Disconnect(OEDataObjList& list, unsigned short index) {
    if (index >= list.Entries()) return nullptr;
    OEDataObj* obj = list.Disconnect(index);
    if (!obj) return nullptr;
    bool more = false;
    for (unsigned short i = 0; i < list.Entries(); ++i)
        if (list.Get(i) && list.Get(i)->GetType() == obj->GetType()) more = true;
    if (!more && obj->GetType() && ValidateTag(obj->GetType())) ClearTag(obj->GetType());
    return obj;
}

int OEMessageSetBase::Build(OEBuilder* builder) {
    if (m_signOn) {
        int status = m_signOn->BuildObject(builder, OETAG_NONE);
        if (status != OEBS_OK) {
            builder->SetFailedObject(this);
            return status;
        }
    }
    const WrapperTables* t = TablesOf(GetType());
    if (!t) return OEBS_OK;
    for (const OETagRow& row : t->m_rows) {
        if (row.m_tag == SignOnTag()) continue;
        if (row.m_tag == OETAG_SECLIST) {
            int status = m_secList ? m_secList->BuildObject(builder, OETAG_NONE) : OEBS_OK;
            if (status != OEBS_OK) {
                builder->SetFailedObject(this);
                return status;
            }
            continue;
        }
        const OEDataObjList& list = IsSyncTag(row.m_tag) ? m_sync : m_trans;
        for (unsigned short i = 0; i < list.Entries(); ++i) {
            OEDataObj* child = list.Get(i);
            if (!child || child->GetType() != row.m_tag) continue;
            int status = child->BuildObject(builder, OETAG_NONE);
            if (status != OEBS_OK) {
                builder->SetFailedObject(this);
                return status;
            }
        }
    }
    return OEBS_OK;
}

unsigned short OEMessageSetBase::AllRequiredPresent() {
    const char* name = OETagDictionary::TheOETagDictionary()->GetTagString(GetType());
    std::string n = name ? name : "";
    auto starts = [&](const char* prefix) { return n.compare(0, std::strlen(prefix), prefix) == 0; };
    if (starts("PROFMSGSR")) return ValidateTag(m_request ? OETAG_PROFTRNRQ : OETAG_PROFTRNRS);
    if (starts("SIGNONMSGSR")) return ValidateTag(SignOnTag());
    if (starts("SECLISTMSGSR")) {
        if (m_request) return ValidateTag(OETAG_SECLISTTRNRQ) && m_trans.Entries() > 0;
        return ValidateTag(OETAG_SECLIST) || m_trans.Entries() > 0;
    }
    // The bill payment sets stay on the last rule on purpose.
    if (starts("BANKMSGSR") || starts("CREDITCARDMSGSR") || starts("INVSTMTMSGSR") ||
        starts("INTERXFERMSGSR") || starts("WIREXFERMSGSR") || starts("EMAILMSGSR") ||
        starts("SIGNUPMSGSR") || starts("KEST."))
        return AnyValidPresent();
    return m_trans.Entries() > 0 || m_sync.Entries() > 0;
}

unsigned short OEMessageSetBase::CopyFrom(const OEMessageSetBase* other) {
    if (!other) return 0;
    if (other == this) return 1;
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return 0;
    if (other->m_signOn) {
        if (!m_signOn) {
            m_signOn = NewSignOn(factory, other->m_signOn->GetMsgSetVersion());
            if (!m_signOn) return 0;
        }
        unsigned short ok = m_request ? CopyEntry(static_cast<OESignOnRq*>(m_signOn), other->m_signOn)
                                      : CopyEntry(static_cast<OESignOnRs*>(m_signOn), other->m_signOn);
        if (!ok) return 0;
    } else if (m_signOn) {
        delete m_signOn;
        m_signOn = nullptr;
        // The response's sign-on mark is cleared on both sides, so a request keeps its SONRQ
        // mark: kept as it is.
        ClearTag(OETAG_SONRS);
    }
    if (other->m_secList) { // response side only
        if (!m_secList) m_secList = factory->NewSecList(other->m_secList->GetMsgSetVersion());
        if (!m_secList || !static_cast<OESecList*>(m_secList)->DeepCopyFrom(
                              static_cast<const OESecList*>(other->m_secList)))
            return 0;
    } else if (m_secList) {
        delete m_secList;
        m_secList = nullptr;
        ClearTag(OETAG_SECLIST);
    }
    // Transactions, then synchronisations: trim, add fresh entries, deep-copy index by index.
    for (int pass = 0; pass < 2; ++pass) {
        OEDataObjList& to = pass == 0 ? m_trans : m_sync;
        const OEDataObjList& from = pass == 0 ? other->m_trans : other->m_sync;
        while (to.Entries() > from.Entries()) to.Delete(static_cast<unsigned short>(to.Entries() - 1));
        unsigned short former = to.Entries();
        for (unsigned short i = former; i < from.Entries(); ++i) {
            const OEDataObj* src = from.Get(i);
            unsigned short v = src ? src->GetMsgSetVersion() : 0;
            OEDataObj* fresh;
            if (pass == 0)
                fresh = NewWrapper(factory, m_request, src ? src->GetType() : OETAG_NONE, v);
            else
                fresh = m_request ? static_cast<OEDataObj*>(factory->NewSyncRq(v))
                                  : static_cast<OEDataObj*>(factory->NewSyncRs(v));
            if (!fresh || !to.Set(i, fresh)) {
                delete fresh;
                return 0;
            }
        }
        for (unsigned short i = 0; i < from.Entries(); ++i) {
            const OEDataObj* src = from.Get(i);
            OEDataObj* dst = to.Get(i);
            if (!src || !dst) return 0;
            unsigned short ok = pass == 0 ? (m_request ? CopyEntry(static_cast<OETransRq*>(dst), src)
                                                       : CopyEntry(static_cast<OETransRs*>(dst), src))
                                          : (m_request ? CopyEntry(static_cast<OESyncRq*>(dst), src)
                                                       : CopyEntry(static_cast<OESyncRs*>(dst), src));
            if (!ok) return 0;
            if (pass == 0 && m_request)
                static_cast<OETransRq*>(dst)->SetMsgsRqTag(
                    static_cast<const OETransRq*>(src)->GetMsgsRqTag());
            if (pass == 0 && !m_request)
                static_cast<OETransRs*>(dst)->SetMsgsRsTag(
                    static_cast<const OETransRs*>(src)->GetMsgsRsTag());
        }
    }
    return CopyBaseMembersFrom(other);
}

// ---------------------------------------------------------------- OEMessageSetRq

unsigned short OEMessageSetRq::DisconnectSignOnRq() {
    if (!m_signOn) return 0;
    m_signOn = nullptr;
    ClearTag(OETAG_SONRQ);
    return 1;
}

OETagID OEMessageSetRq::MsgIDToMsgSetID(OETagID tag) {
    switch (tag) {
    case OETAG_CHALLENGERQ:
    case OETAG_PINCHRQ:
    case OETAG_SONRQ:
        return OETAG_SIGNONMSGSET;
    case OETAG_PROFRQ:
        return OETAG_PROFMSGSET;
    case OETAG_ACCTINFORQ:
    case OETAG_ACCTSYNCRQ:
        return OETAG_SIGNUPMSGSET;
    case OETAG_STMTRQ:
    case OETAG_STMTENDRQ:
    case OETAG_STPCHKRQ:
    case OETAG_BANKMAILRQ:
    case OETAG_BANKMAILSYNCRQ:
    case OETAG_INTRARQ:
    case OETAG_INTRAMODRQ:
    case OETAG_INTRACANRQ:
    case OETAG_INTRASYNCRQ:
    case OETAG_RECINTRARQ:
    case OETAG_RECINTRAMODRQ:
    case OETAG_RECINTRACANRQ:
    case OETAG_RECINTRASYNCRQ:
        return OETAG_BANKMSGSET;
    case OETAG_CCSTMTRQ:
    case OETAG_CCSTMTENDRQ:
        return OETAG_CREDITCARDMSGSET;
    case OETAG_INTERRQ:
    case OETAG_INTERMODRQ:
    case OETAG_INTERCANRQ:
    case OETAG_INTERSYNCRQ:
    case OETAG_RECINTERRQ:
    case OETAG_RECINTERMODRQ:
    case OETAG_RECINTERCANRQ:
    case OETAG_RECINTERSYNCRQ:
        return OETAG_INTERXFERMSGSET;
    case OETAG_WIRERQ:
    case OETAG_WIRECANRQ:
    case OETAG_WIRESYNCRQ:
        return OETAG_WIREXFERMSGSET;
    case OETAG_INVSTMTRQ:
    case OETAG_INVMAILRQ:
    case OETAG_INVMAILSYNCRQ:
        return OETAG_INVSTMTMSGSET;
    // The e-mail row keys on the wrapper, not on MAILRQ.
    case OETAG_MAILTRNRQ:
    case OETAG_MAILSYNCRQ:
        return OETAG_EMAILMSGSET;
    case OETAG_PAYEERQ:
    case OETAG_PAYEESYNCRQ:
    case OETAG_PMTRQ:
    case OETAG_PMTSYNCRQ:
    case OETAG_PMTINQRQ:
    case OETAG_PMTMAILRQ:
    case OETAG_PMTMAILSYNCRQ:
    case OETAG_RECPMTRQ:
    case OETAG_RECPMTSYNCRQ:
        return OETAG_BILLPAYMSGSET;
    case OETAG_K_PAYROLLENROLLTRNRQ:
    case OETAG_K_PAYROLLUPDATERQ:
        return OETAG_K_PAYROLLMSGSET;
    default:
        return OETAG_NONE;
    }
}

// ---------------------------------------------------------------- OEMessageSetRs

unsigned short OEMessageSetRs::SetSecList(OESecList* list) {
    if (!IsValidTag(OETAG_SECLIST)) return 0;
    if (m_secList != list) delete m_secList;
    if (!list) ClearTag(OETAG_SECLIST);
    m_secList = list;
    SetTag(OETAG_SECLIST);
    return 1;
}

// ================================================================ roots

OERootBase::OERootBase(unsigned short version, bool request)
    : OEDataObj(version), m_request(request), m_sets(4, 4) {}

OERootBase::~OERootBase() {}

void OERootBase::DeleteAllMessageSet() {
    for (unsigned short i = 0; i < m_sets.Entries(); ++i)
        if (m_sets.Get(i) && ValidateTag(m_sets.Get(i)->GetType())) ClearTag(m_sets.Get(i)->GetType());
    m_sets.DeleteAll();
}

unsigned short OERootBase::SetFactory(OEDataObjFactory* factory) {
    if (!factory) return 0;
    return OEDataObj::SetFactory(factory);
}

unsigned short OERootBase::GetArrayOfValidTags(OEArrayOfTags& tags) const {
    if (m_request)
        tags.Set(kRootRqValid, static_cast<unsigned short>(sizeof(kRootRqValid) / sizeof(kRootRqValid[0])));
    else
        tags.Set(RootRsValid().data(), static_cast<unsigned short>(RootRsValid().size()));
    return 1;
}

// Any wrapper of the valid list is accepted, V1 or V2, whatever version the root was made with:
// a set's version comes from its own tag, so a V1 sign-on set and a V2 bank set may share a body.
OEParseStatus OERootBase::HandleTagStart(const OETagDictionaryEntry* entry) {
    if (!entry) return OEPS_INVALID;
    OEArrayOfTags valid;
    GetArrayOfValidTags(valid);
    for (unsigned short i = 0; i < valid.m_count; ++i)
        if (valid.m_rows[i].m_tag == entry->m_id) return PushMsgObject(entry->m_id);
    return OEPS_INVALID;
}

OEParseStatus OERootBase::PushMsgObject(OETagID tag) {
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return OEPS_NORESOURCE;
    for (unsigned short i = 0; i < m_sets.Entries(); ++i) {
        if (m_sets.Get(i) && m_sets.Get(i)->GetType() == tag) {
            OELogParseWarning(OEPW_EXTRAAGG, "", "", tag, this);
            return OEPS_INVALID;
        }
    }
    OEMessageSetBase* set =
        m_request ? static_cast<OEMessageSetBase*>(factory->NewMessageSetRq(OEDataObj::GetMsgSetVersion()))
                  : static_cast<OEMessageSetBase*>(factory->NewMessageSetRs(OEDataObj::GetMsgSetVersion()));
    if (!set) return OEPS_NORESOURCE;
    set->SetType(tag);
    if (!m_sets.Append(set)) {
        delete set;
        return OEPS_INVALID;
    }
    SetTag(tag);
    return PushAndSetObject(set, OETAG_NONE);
}

unsigned short OERootBase::Store(unsigned short index, OEMessageSetBase* set, bool append) {
    if (!set) return 0;
    if (append) index = m_sets.Entries();
    if (index > m_sets.Entries()) return 0;
    if (!m_sets.Set(index, set)) return 0;
    if (set->GetType()) SetTag(set->GetType());
    return 1;
}

int OERootBase::Build(OEBuilder* builder) {
    for (OETagID rqTag : kRootBuildOrder) {
        OETagID tag = m_request ? rqTag : OEResponseTagOf(rqTag);
        unsigned short count = 0;
        for (unsigned short i = 0; i < m_sets.Entries(); ++i)
            if (m_sets.Get(i) && m_sets.Get(i)->GetType() == tag) ++count;
        if (count > 1) {
            builder->SetFailedObject(this);
            return OEBS_DUPLICATECHILD;
        }
        if (count == 0) continue;
        for (unsigned short i = 0; i < m_sets.Entries(); ++i) {
            OEMessageSetBase* set = m_sets.Get(i);
            if (!set || set->GetType() != tag) continue;
            int status = set->BuildObject(builder, OETAG_NONE);
            if (status != OEBS_OK) {
                builder->SetFailedObject(this);
                return status;
            }
        }
    }
    return OEBS_OK;
}

unsigned short OERootBase::AllRequiredPresent() {
    OETagID v1 = m_request ? OETAG_SIGNONMSGSRQV1 : OETAG_SIGNONMSGSRSV1;
    OETagID v2 = m_request ? OETAG_SIGNONMSGSRQV2 : OETAG_SIGNONMSGSRSV2;
    bool signOn = false;
    for (unsigned short i = 0; i < m_sets.Entries(); ++i)
        if (m_sets.Get(i) && (m_sets.Get(i)->GetType() == v1 || m_sets.Get(i)->GetType() == v2))
            signOn = true;
    return signOn && m_sets.Entries() > 0;
}

unsigned short OERootBase::CopyFrom(const OERootBase* other) {
    if (!other || other->m_request != m_request) return 0;
    if (other == this) return 1;
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return 0;
    while (m_sets.Entries() > other->m_sets.Entries())
        m_sets.Delete(static_cast<unsigned short>(m_sets.Entries() - 1));
    for (unsigned short i = m_sets.Entries(); i < other->m_sets.Entries(); ++i) {
        OEMessageSetBase* fresh = m_request ? static_cast<OEMessageSetBase*>(factory->NewMessageSetRq(0))
                                            : static_cast<OEMessageSetBase*>(factory->NewMessageSetRs(0));
        if (!fresh || !m_sets.Set(i, fresh)) {
            delete fresh;
            return 0;
        }
    }
    for (unsigned short i = 0; i < other->m_sets.Entries(); ++i) {
        const OEMessageSetBase* src = other->m_sets.Get(i);
        OEMessageSetBase* dst = m_sets.Get(i);
        if (!src || !dst) return 0;
        unsigned short ok =
            m_request
                ? static_cast<OEMessageSetRq*>(dst)->DeepCopyFrom(static_cast<const OEMessageSetRq*>(src))
                : static_cast<OEMessageSetRs*>(dst)->DeepCopyFrom(static_cast<const OEMessageSetRs*>(src));
        if (!ok) return 0;
    }
    return CopyBaseMembersFrom(other);
}
