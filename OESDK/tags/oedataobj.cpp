#include "tags/oedataobj.h"

#include "foundation/oememory.h"
#include "foundation/internal/oepool.h"
#include "foundation/oeparsewarning.h"
#include "foundation/oethread.h"
#include "parse/oeparser.h"
#include "tags/oedatafactory.h"

// The builder lives in the layer above; BuildObject drives it through its tag writers.
#if __has_include("build/oebuilder.h")
#include "build/oebuilder.h"
#define OESDK_HAVE_BUILDER 1
#endif

#include <cstring>

OEDataObjFactory* OEDataObj::m_factoryObj = nullptr;
unsigned short OEDataObj::m_factoryAllocated = 0;

// Every constructor clears m_factoryAllocated on purpose: once any data object has been made
// after the library created its default factory, no data object's destruction frees it (the
// factory then lives until SetFactory replaces it).
void* OEDataObj::operator new(std::size_t bytes) {
    void* block = OEMemory::PoolAllocPlain(bytes);
    if (!block) throw std::bad_alloc();
    return block;
}

void* OEDataObj::operator new(std::size_t bytes, const std::nothrow_t&) noexcept {
    return OEMemory::PoolAllocPlain(bytes);
}

void OEDataObj::operator delete(void* block) noexcept {
    OEMemory::PoolFree(block);
}

void OEDataObj::operator delete(void* block, const std::nothrow_t&) noexcept {
    OEMemory::PoolFree(block);
}

OEDataObj::OEDataObj(unsigned short msgSetVersion)
    : m_parser(nullptr), m_present{0, 0, 0}, m_type(OETAG_NONE), m_msgSetVersion(msgSetVersion) {
    m_factoryAllocated = 0;
}

OEDataObj::OEDataObj(const OEDataObj& other)
    : m_parser(other.m_parser), m_present{other.m_present[0], other.m_present[1], other.m_present[2]},
      m_type(other.m_type), m_msgSetVersion(other.m_msgSetVersion) {
    m_factoryAllocated = 0;
}

OEDataObj& OEDataObj::operator=(const OEDataObj& other) {
    if (this != &other) CopyBaseMembersFrom(&other);
    return *this;
}

OEDataObj::~OEDataObj() {
    if (m_factoryAllocated) {
        OEDataObjFactory* factory = m_factoryObj;
        m_factoryObj = nullptr;
        m_factoryAllocated = 0;
        delete factory;
    }
}

OEParseStatus OEDataObj::SetupForParsing(OEParser* parser) {
    m_parser = parser;
    return OEPS_OK;
}

OEParseStatus OEDataObj::HandleTagStart(const OETagDictionaryEntry*) {
    return OEPS_INVALID;
}

namespace {
// The object whose base HandleTagElement is forwarding on this thread. A class that overrides
// neither form would otherwise bounce between the two forever; the second bounce answers 4 (the
// element is not handled), which is what such a class means.
thread_local const OEDataObj* t_forwarding = nullptr;

struct ForwardGuard {
    explicit ForwardGuard(const OEDataObj* object) : m_saved(t_forwarding) { t_forwarding = object; }
    ~ForwardGuard() { t_forwarding = m_saved; }
    const OEDataObj* m_saved;
};
} // namespace

OEParseStatus OEDataObj::HandleTagElement(const OETagDictionaryEntry* entry, const char* value) {
    if (t_forwarding == this) return OEPS_INVALID;
    ForwardGuard guard(this);
    OEString text(value);
    return HandleTagElement(entry, text);
}

OEParseStatus OEDataObj::HandleTagElement(const OETagDictionaryEntry* entry, const OEString& value) {
    if (t_forwarding == this) return OEPS_INVALID;
    ForwardGuard guard(this);
    return HandleTagElement(entry, value.c_str());
}

OEParseStatus OEDataObj::HandleTagEnd(const OETagDictionaryEntry* entry) {
    if (!m_parser) return OEPS_NORESOURCE;
    if (entry && entry->m_id == GetType()) {
        m_parser->PopObject();
        return OEPS_OK;
    }
    OELogParseWarning(OEPW_INVALIDENDAGG, entry ? entry->m_name : "", nullptr,
                      entry ? entry->m_id : OETAG_NONE, this);
    return OEPS_BADENDTAG;
}

OEParseStatus OEDataObj::HandleHeader(OEHeaderTag, const OEString&, OEString*) {
    return OEPS_OK;
}

unsigned short OEDataObj::GetArrayOfValidTags(OEArrayOfTags& tags) const {
    tags.Set(nullptr, 0);
    return 1;
}

unsigned short OEDataObj::GetArrayOfRequiredTags(OEArrayOfTags& tags) const {
    tags.Set(nullptr, 0);
    return 1;
}

int OEDataObj::Build(OEBuilder*) {
    return OEBS_OK;
}

int OEDataObj::BuildObject(OEBuilder* builder, OETagID tag) {
#ifdef OESDK_HAVE_BUILDER
    if (!builder) return OEBS_BADARGUMENT;
    if (tag == OETAG_NONE) tag = GetType();
    int status = builder->AddTagStart(tag);
    if (status != OEBS_OK) return status;
    status = Build(builder);
    if (status != OEBS_OK) return status;
    return builder->AddTagEnd(tag);
#else
    // No builder class is compiled into this library yet, so no caller can hold one.
    (void)builder;
    (void)tag;
    return OEBS_BADARGUMENT;
#endif
}

OEParseStatus OEDataObj::PushAndSetObject(OEDataObj* child, OETagID tag) {
    if (!child) return OEPS_NORESOURCE;
    if (tag != OETAG_NONE) {
        child->SetType(tag);
        if (!SetTag(tag)) return OEPS_INVALID;
    }
    if (m_msgSetVersion) child->SetMsgSetVersion(m_msgSetVersion);
    if (!m_parser) return OEPS_NORESOURCE;
    if (!m_parser->PushObject(child)) return OEPS_TOODEEP;
    return OEPS_OK;
}

OEParseStatus OEDataObj::ProcessResponse() {
    return OEPS_OK;
}

OEParseStatus OEDataObj::ProcessRequest(const ServerImpl*) {
    return OEPS_OK;
}

unsigned short OEDataObj::GetBitValue(OETagID tag, std::uint32_t* mask) const {
    mask[0] = mask[1] = mask[2] = 0;
    OEArrayOfTags valid;
    GetArrayOfValidTags(valid);
    if (!valid.m_rows) return 0;
    unsigned short count =
        valid.m_count < kMaxValidTags ? valid.m_count : static_cast<unsigned short>(kMaxValidTags);
    for (unsigned short k = 0; k < count; ++k) {
        const OETagRow& row = valid.m_rows[k];
        if (row.m_tag == tag && (row.m_versionMask & m_msgSetVersion) != 0) {
            mask[k / 32] = std::uint32_t(1) << (k % 32);
            return 1;
        }
    }
    return 0;
}

unsigned short OEDataObj::SetTag(OETagID tag) {
    std::uint32_t mask[3];
    if (!GetBitValue(tag, mask)) return 0;
    for (int i = 0; i < 3; ++i) m_present[i] |= mask[i];
    return 1;
}

unsigned short OEDataObj::ClearTag(OETagID tag) {
    std::uint32_t mask[3];
    if (!GetBitValue(tag, mask)) {
        OETagDictionary* dictionary = OETagDictionary::TheOETagDictionary();
        const OETagDictionaryEntry* entry = dictionary ? dictionary->FindDictionaryEntry(tag) : nullptr;
        OELogParseWarning(OEPW_UNKNOWNTAG, entry ? entry->m_name : "", nullptr, tag, this);
        return 0;
    }
    for (int i = 0; i < 3; ++i) m_present[i] &= ~mask[i];
    return 1;
}

unsigned short OEDataObj::ValidateTag(OETagID tag) const {
    std::uint32_t mask[3];
    if (!GetBitValue(tag, mask)) return 0;
    for (int i = 0; i < 3; ++i)
        if (m_present[i] & mask[i]) return 1;
    return 0;
}

unsigned short OEDataObj::IsValidTag(OETagID tag) const {
    std::uint32_t mask[3];
    return GetBitValue(tag, mask);
}

// A required row is missing when its tag is not a valid tag of this object or its mark is clear.
unsigned short OEDataObj::IsRequiredRowMissing(const OETagRow& row) const {
    return ValidateTag(row.m_tag) ? 0 : 1;
}

unsigned short OEDataObj::AllRequiredPresent() {
    OEArrayOfTags required;
    GetArrayOfRequiredTags(required);
    if (!required.m_rows) return 1;
    for (unsigned short i = 0; i < required.m_count; ++i) {
        const OETagRow& row = required.m_rows[i];
        if ((row.m_versionMask & m_msgSetVersion) && IsRequiredRowMissing(row)) return 0;
    }
    return 1;
}

OETagID OEDataObj::GetFirstMissingRequiredTag(OETagID after) {
    OEArrayOfTags required;
    GetArrayOfRequiredTags(required);
    if (!required.m_rows) return OETAG_NONE;
    bool passed = after == OETAG_NONE;
    for (unsigned short i = 0; i < required.m_count; ++i) {
        const OETagRow& row = required.m_rows[i];
        if (!(row.m_versionMask & m_msgSetVersion) || !IsRequiredRowMissing(row)) continue;
        if (passed) return row.m_tag;
        if (row.m_tag == after) passed = true;
    }
    return OETAG_NONE;
}

unsigned short OEDataObj::IsTagRequired(OETagID tag) {
    OEArrayOfTags required;
    GetArrayOfRequiredTags(required);
    if (!required.m_rows) return 0;
    for (unsigned short i = 0; i < required.m_count; ++i) {
        const OETagRow& row = required.m_rows[i];
        if (row.m_tag == tag && (row.m_versionMask & m_msgSetVersion)) return 1;
    }
    return 0;
}

namespace {
// Bits 0..count-1 of the three words, the only ones a table of `count` rows can own.
inline std::uint32_t RowBits(unsigned short count, int word) {
    int bits = static_cast<int>(count) - 32 * word;
    if (bits <= 0) return 0;
    if (bits >= 32) return 0xFFFFFFFFu;
    return (std::uint32_t(1) << bits) - 1;
}

inline int PopCount(std::uint32_t v) {
    int n = 0;
    for (; v; v &= v - 1) ++n;
    return n;
}
} // namespace

unsigned short OEDataObj::AnyValidPresent() {
    OEArrayOfTags valid;
    GetArrayOfValidTags(valid);
    for (int i = 0; i < 3; ++i)
        if (m_present[i] & RowBits(valid.m_count, i)) return 1;
    return 0;
}

unsigned short OEDataObj::OneValidPresent() {
    OEArrayOfTags valid;
    GetArrayOfValidTags(valid);
    int n = 0;
    for (int i = 0; i < 3; ++i) n += PopCount(m_present[i] & RowBits(valid.m_count, i));
    return n == 1 ? 1 : 0;
}

unsigned short OEDataObj::SetMsgSetVersion(unsigned short version) {
    m_msgSetVersion = version;
    return 1;
}

unsigned short OEDataObj::GetMsgSetVersion() const {
    return m_msgSetVersion;
}

unsigned short OEDataObj::GetMsgSetVersionFromTag() const {
    OETagDictionary* dictionary = OETagDictionary::TheOETagDictionary();
    const OETagDictionaryEntry* entry = dictionary ? dictionary->FindDictionaryEntry(GetType()) : nullptr;
    if (!entry || !entry->m_name) return 0;
    std::size_t n = std::strlen(entry->m_name);
    if (n == 0) return 0;
    char last = entry->m_name[n - 1];
    return last == '1' ? 1 : last == '2' ? 2 : 0;
}

OETagID OEDataObj::GetType() const {
    return m_type;
}

void OEDataObj::SetType(OETagID type) {
    m_type = type;
}

OEDataObj* OEDataObj::GetChild(unsigned short) const {
    return nullptr;
}

unsigned short OEDataObj::GetNumberOfChildren() const {
    return 0;
}

unsigned short OEDataObj::CopyBaseMembersFrom(const OEDataObj* other) {
    if (!other) return 0;
    m_parser = other->m_parser;
    for (int i = 0; i < 3; ++i) m_present[i] = other->m_present[i];
    m_type = other->m_type;
    m_msgSetVersion = other->m_msgSetVersion;
    return 1;
}

OEDataObjFactory* OEDataObj::GetFactory() {
    if (!m_factoryObj) {
        OEDataObjFactory* factory = OEMemory::New<OEDataObjFactory>(static_cast<unsigned short>(1));
        if (!factory) return nullptr;
        m_factoryObj = factory;
        m_factoryAllocated = 1;
    }
    return m_factoryObj;
}

unsigned short OEDataObj::SetFactory(OEDataObjFactory* factory) {
    if (m_factoryAllocated && m_factoryObj != factory) delete m_factoryObj;
    m_factoryObj = factory;
    m_factoryAllocated = 0;
    return 1;
}

const char* OEDataObj::GetOESDKVersion() {
    return OESDK_VERSION_STRING;
}
