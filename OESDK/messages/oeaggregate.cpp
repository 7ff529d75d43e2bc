#include "messages/oeaggregate.h"

#include "build/oebuilder.h"
#include "foundation/oememory.h"
#include "foundation/oeparsewarning.h"
#include "foundation/oethread.h"

#include <cstdint>
#include <cstdio>
#include <cstring>
#include <new>
#include <string>

namespace {

// The builder's own value writer of an enumeration, found by the keyword table a row names. Rows
// of these enumerations are written through it, so a builder subclass that overrides, say,
// AddBankTxType changes TRNTYPE wherever it is written; the text is the same keyword either way.
// Rows of other enumerations (or of a list of their own, as COUPONFREQ) write their keyword.
typedef OEBuildStatus (*OEEnumWriter)(OEBuilder* builder, unsigned short value);
struct OEEnumWriterRow {
    const OEKeywordTable* m_table;
    OEEnumWriter m_write;
};
#define OE_BY_VALUE(op, Type) [](OEBuilder* b, unsigned short v) { return b->op(static_cast<Type>(v)); }
#define OE_BY_REF(op, Type)                                                                                  \
    [](OEBuilder* b, unsigned short v) {                                                                     \
        const Type value = static_cast<Type>(v);                                                             \
        return b->op(value);                                                                                 \
    }
const OEEnumWriterRow kEnumWriters[] = {
    // The transaction type first: it is the one in every statement line.
    {&OEKW_BANKTXTYPE, OE_BY_VALUE(AddBankTxType, OEBankTxType)},
    {&OEKW_CORRECTACTION, OE_BY_VALUE(AddBankAction, OEBankAction)},
    {&OEKW_BANKACCOUNTTYPE, OE_BY_VALUE(AddBankAccountType, OEBankAccountType)},
    {&OEKW_OFXSECURITY, OE_BY_VALUE(AddOFXSecurity, OEOFXSecurity)},
    {&OEKW_SYNCMODE, OE_BY_VALUE(AddSyncMode, OESyncMode)},
    {&OEKW_CHARTYPE, OE_BY_VALUE(AddCharacterType, OECharacterType)},
    {&OEKW_CLIENTROUTING, OE_BY_VALUE(AddClientRouting, OEClientRouting)},
    {&OEKW_BALTYPE, OE_BY_REF(AddBalType, OEBalType)},
    {&OEKW_ASSETCLASS, OE_BY_REF(AddAssetClass, OEAssetClass)},
    {&OEKW_DEBTTYPE, OE_BY_REF(AddDebtType, OEDebtType)},
    {&OEKW_DEBTCLASS, OE_BY_REF(AddDebtClass, OEDebtClass)},
    {&OEKW_CALLTYPE, OE_BY_REF(AddCallType, OECallType)},
    {&OEKW_MFTYPE, OE_BY_REF(AddMFType, OEMFType)},
    {&OEKW_STOCKTYPE, OE_BY_REF(AddStockType, OEStockType)},
};
#undef OE_BY_VALUE
#undef OE_BY_REF

OEEnumWriter EnumWriterFor(const OEKeywordTable* table) {
    for (const OEEnumWriterRow& row : kEnumWriters)
        if (row.m_table == table) return row.m_write;
    return nullptr;
}

} // namespace

namespace {

// Case-insensitive keyword match over a table: the index of the first word equal to the text
// ignoring ASCII case, or -1. Each table gets, on first use, a small hash of its words by length
// and first eight letters in upper case, so a match is a probe or two instead of a walk.
inline char UpperAscii(char c) {
    return (c >= 'a' && c <= 'z') ? static_cast<char>(c - 32) : c;
}

bool SameIgnoringCase(const char* a, const char* b, std::size_t n) {
    for (std::size_t i = 0; i < n; ++i)
        if (UpperAscii(a[i]) != UpperAscii(b[i])) return false;
    return true;
}

// The first eight bytes of a text of `length` bytes, upper-cased, zero-padded. The bytes are read
// as one or two word loads that stay inside the text and upper-cased eight at a time (the byte
// order of the key is that of the machine: the targets are little-endian).
#if defined(__BYTE_ORDER__) && __BYTE_ORDER__ != __ORDER_LITTLE_ENDIAN__
#error "UpperKey assembles its key in little-endian byte order"
#endif
inline std::uint64_t UpperKey(const char* text, std::size_t length) {
    std::uint64_t key = 0;
    if (length >= 8) {
        std::memcpy(&key, text, 8);
    } else if (length >= 4) {
        std::uint32_t head, tail; // overlapping when shorter than 8: the shared bytes agree
        std::memcpy(&head, text, 4);
        std::memcpy(&tail, text + length - 4, 4);
        key = head | (std::uint64_t(tail) << (8 * (length - 4)));
    } else {
        for (std::size_t i = 0; i < length; ++i)
            key |= std::uint64_t(static_cast<unsigned char>(text[i])) << (8 * i);
    }
    // Per byte: 'a' to 'z' (high bit clear) loses 0x20; carries never cross a byte.
    const std::uint64_t ones = 0x0101010101010101ull;
    const std::uint64_t low7 = key & (0x7F * ones);
    const std::uint64_t atLeastA = low7 + (0x80 - 'a') * ones;
    const std::uint64_t aboveZ = low7 + (0x80 - 'z' - 1) * ones;
    const std::uint64_t lower = atLeastA & ~aboveZ & ~key & (0x80 * ones);
    return key - (lower >> 2);
}

struct KeywordLookup {
    struct Slot {
        std::uint64_t m_key;
        unsigned short m_length; // 0: empty
        unsigned short m_index;
    };
    unsigned m_mask;
    Slot* m_slots;

    static unsigned Hash(std::uint64_t key, std::size_t length) {
        const std::uint64_t h = (key ^ length) * 0x9E3779B97F4A7C15ull;
        return static_cast<unsigned>(h >> 40);
    }
    int Find(const OEKeywordTable& table, const char* text, std::size_t length) const {
        const std::uint64_t key = UpperKey(text, length);
        for (unsigned i = Hash(key, length) & m_mask;; i = (i + 1) & m_mask) {
            const Slot& s = m_slots[i];
            if (s.m_length == 0) return -1;
            if (s.m_key == key && s.m_length == length &&
                (length <= 8 || SameIgnoringCase(table.m_words[s.m_index] + 8, text + 8, length - 8)))
                return s.m_index;
        }
    }
};

const KeywordLookup* BuildKeywordLookup(const OEKeywordTable& table) {
    unsigned size = 8;
    while (size < 2u * table.m_count) size *= 2;
    unsigned char* block =
        new (std::nothrow) unsigned char[sizeof(KeywordLookup) + size * sizeof(KeywordLookup::Slot)];
    if (!block) return nullptr;
    KeywordLookup* lookup = new (block) KeywordLookup;
    lookup->m_mask = size - 1;
    lookup->m_slots = reinterpret_cast<KeywordLookup::Slot*>(block + sizeof(KeywordLookup));
    for (unsigned i = 0; i < size; ++i) lookup->m_slots[i] = KeywordLookup::Slot{0, 0, 0};
    for (unsigned short w = 0; w < table.m_count; ++w) {
        const char* word = table.m_words[w];
        const std::size_t length = word ? std::strlen(word) : 0;
        if (length == 0 || length > 0xFFFF) continue;         // never matched: texts are not empty here
        if (lookup->Find(table, word, length) >= 0) continue; // an earlier word already answers
        const std::uint64_t key = UpperKey(word, length);
        unsigned i = KeywordLookup::Hash(key, length) & lookup->m_mask;
        while (lookup->m_slots[i].m_length) i = (i + 1) & lookup->m_mask;
        lookup->m_slots[i] = KeywordLookup::Slot{key, static_cast<unsigned short>(length), w};
    }
    return lookup;
}

int MatchKeyword(const OEKeywordTable* table, const char* text, std::size_t length) {
    if (!table || length == 0) return -1;
    const void* cached = table->m_lookup.load(std::memory_order_acquire);
    if (!cached) {
        const KeywordLookup* fresh = BuildKeywordLookup(*table);
        if (!fresh) { // no memory for the lookup: walk the table
            for (unsigned short i = 0; i < table->m_count; ++i) {
                const char* word = table->m_words[i];
                if (word && std::strlen(word) == length && SameIgnoringCase(word, text, length)) return i;
            }
            return -1;
        }
        // Another thread may have been first; the loser's lookup is dropped. Lookups live as long
        // as the process, like the descriptors' indexes.
        if (table->m_lookup.compare_exchange_strong(cached, fresh, std::memory_order_acq_rel)) {
            cached = fresh;
        } else {
            delete[] reinterpret_cast<const unsigned char*>(fresh);
        }
    }
    return static_cast<const KeywordLookup*>(cached)->Find(*table, text, length);
}

// Strict decimal number: optional sign, digits only.
bool ParseLong(const char* text, bool allowSign, long long& out) {
    const char* p = text;
    bool negative = false;
    if (allowSign && (*p == '-' || *p == '+')) negative = *p++ == '-';
    if (!*p) return false;
    long long value = 0;
    for (; *p; ++p) {
        if (*p < '0' || *p > '9') return false;
        value = value * 10 + (*p - '0');
        if (value > 0xFFFFFFFFLL) return false;
    }
    out = negative ? -value : value;
    return true;
}

} // namespace

OEAggregate::OEAggregate(unsigned short version) : OEDataObj(version) {}

// The index of a descriptor, in one block: the hash slots, then one presence bit and one
// "another valid row has this tag" flag per field row.
struct OEAggregateIndex {
    struct Slot {
        OETagID m_tag;        // OETAG_NONE: empty
        unsigned short m_row; // first field row with the tag, or 0xFFFF
        unsigned char m_bit;  // first valid row with the tag (its presence bit), or 0xFF
        unsigned char m_dup;  // 1 when a later valid row has the same tag (other versions)
    };
    unsigned m_mask;
    const Slot* m_slots;
    const unsigned char* m_rowBit;
    const unsigned char* m_rowDup;
    // For Build (descriptors of at most kMaxRows field rows): per presence bit the set of field
    // rows it alone marks, and the set of rows whose presence is not one bit, lists (always
    // written) and tags repeated in the valid table. Row i is bit i % 64 of word i / 64, so the
    // union of the sets of the present bits, read from the low bit up, is the build order.
    enum { kMaxRows = 128, kRowWords = kMaxRows / 64 };
    typedef std::uint64_t RowSet[kRowWords];
    const RowSet* m_bitRows; // null when the descriptor has more rows
    unsigned short m_bitCount;
    RowSet m_special;
    // Per field row, the builder's value writer of its enumeration (null: the keyword is written).
    const OEEnumWriter* m_rowWriter;

    static unsigned Hash(OETagID tag) { return (static_cast<unsigned>(tag) * 0x9E3779B1u) >> 16; }
    const Slot* Find(OETagID tag) const {
        if (tag == OETAG_NONE) return nullptr;
        for (unsigned i = Hash(tag) & m_mask;; i = (i + 1) & m_mask) {
            if (m_slots[i].m_tag == tag) return &m_slots[i];
            if (m_slots[i].m_tag == OETAG_NONE) return nullptr;
        }
    }
};

namespace {

// The rows of the valid table that own a presence bit.
inline unsigned short BitRows(const OEAggregateDesc& d) {
    return d.m_validCount < OEDataObj::kMaxValidTags ? d.m_validCount
                                                     : static_cast<unsigned short>(OEDataObj::kMaxValidTags);
}

// The search SetTag makes: the first valid row with the tag that applies at `version`, from row
// `from` on; -1 when there is none.
int ScanBit(const OEAggregateDesc& d, OETagID tag, unsigned short version, unsigned short from = 0) {
    const unsigned short count = BitRows(d);
    for (unsigned short k = from; k < count; ++k)
        if (d.m_valid[k].m_tag == tag && (d.m_valid[k].m_versionMask & version)) return k;
    return -1;
}

OEAggregateIndex* BuildIndex(const OEAggregateDesc& d) {
    typedef OEAggregateIndex::Slot Slot;
    const unsigned short bitRows = BitRows(d);
    unsigned size = 8;
    while (size < 2u * (static_cast<unsigned>(d.m_fieldCount) + bitRows)) size *= 2;
    const std::size_t rows = d.m_fieldCount ? d.m_fieldCount : 1;
    const bool rowSets = d.m_fieldCount <= OEAggregateIndex::kMaxRows;
    const std::size_t setCount = rowSets ? bitRows : 0;
    // Slots, then the row sets and writers (8-byte aligned), then the bytes per row.
    const std::size_t head =
        (sizeof(OEAggregateIndex) + size * sizeof(Slot) + 7) & ~static_cast<std::size_t>(7);
    const std::size_t bytes =
        head + setCount * sizeof(OEAggregateIndex::RowSet) + rows * sizeof(OEEnumWriter) + 2 * rows;
    unsigned char* block = new (std::nothrow) unsigned char[bytes];
    if (!block) return nullptr;
    OEAggregateIndex* index = new (block) OEAggregateIndex;
    Slot* slots = reinterpret_cast<Slot*>(block + sizeof(OEAggregateIndex));
    OEAggregateIndex::RowSet* bitSets = reinterpret_cast<OEAggregateIndex::RowSet*>(block + head);
    OEEnumWriter* writers = reinterpret_cast<OEEnumWriter*>(bitSets + setCount);
    unsigned char* rowBit = reinterpret_cast<unsigned char*>(writers + rows);
    unsigned char* rowDup = rowBit + rows;
    for (unsigned i = 0; i < size; ++i) slots[i] = Slot{OETAG_NONE, 0xFFFF, 0xFF, 0};
    for (std::size_t k = 0; k < setCount; ++k)
        for (unsigned w = 0; w < OEAggregateIndex::kRowWords; ++w) bitSets[k][w] = 0;
    index->m_mask = size - 1;
    index->m_slots = slots;
    index->m_rowBit = rowBit;
    index->m_rowDup = rowDup;
    index->m_bitRows = rowSets ? bitSets : nullptr;
    index->m_bitCount = static_cast<unsigned short>(setCount);
    for (unsigned w = 0; w < OEAggregateIndex::kRowWords; ++w) index->m_special[w] = 0;
    index->m_rowWriter = writers;
    auto slotOf = [&](OETagID tag) -> Slot* {
        unsigned i = OEAggregateIndex::Hash(tag) & index->m_mask;
        while (slots[i].m_tag != OETAG_NONE && slots[i].m_tag != tag) i = (i + 1) & index->m_mask;
        slots[i].m_tag = tag;
        return &slots[i];
    };
    for (unsigned short k = 0; k < bitRows; ++k) {
        if (d.m_valid[k].m_tag == OETAG_NONE) continue;
        Slot* s = slotOf(d.m_valid[k].m_tag);
        if (s->m_bit == 0xFF)
            s->m_bit = static_cast<unsigned char>(k);
        else
            s->m_dup = 1;
    }
    for (unsigned short i = 0; i < d.m_fieldCount; ++i) {
        rowBit[i] = 0xFF;
        rowDup[i] = 0;
        writers[i] = d.m_fields[i].m_kind == OEFK_ENUM ? EnumWriterFor(d.m_fields[i].m_keywords) : nullptr;
        if (d.m_fields[i].m_tag == OETAG_NONE) continue;
        Slot* s = slotOf(d.m_fields[i].m_tag);
        if (s->m_row == 0xFFFF) s->m_row = i;
        rowBit[i] = s->m_bit;
        rowDup[i] = s->m_dup;
    }
    for (unsigned short i = 0; rowSets && i < d.m_fieldCount; ++i) {
        const std::uint64_t bit = std::uint64_t(1) << (i % 64);
        if (d.m_fields[i].m_kind == OEFK_LIST || (rowDup[i] && rowBit[i] != 0xFF))
            index->m_special[i / 64] |= bit;
        else if (rowBit[i] != 0xFF) // else never present
            bitSets[rowBit[i]][i / 64] |= bit;
    }
    return index;
}

} // namespace

const OEAggregateIndex* OEAggregateDesc::MakeIndex() const {
    OEAggregateIndex* fresh = BuildIndex(*this);
    if (!fresh) return nullptr;
    const OEAggregateIndex* expected = nullptr;
    if (!m_index.compare_exchange_strong(expected, fresh, std::memory_order_acq_rel)) {
        delete[] reinterpret_cast<unsigned char*>(
            fresh); // another thread won; indexes live as long as the process
        return expected;
    }
    return fresh;
}

const unsigned char* OEAggregateDesc::Bits() const {
    const OEAggregateIndex* index = Index();
    return index ? index->m_rowBit : nullptr;
}

namespace {

#if defined(__GNUC__)
#define OE_COLD __attribute__((noinline, cold))
#define OE_ALWAYS_INLINE inline __attribute__((always_inline))
#else
#define OE_COLD
#define OE_ALWAYS_INLINE inline
#endif

// Locate without an index (memory was short): the tables are searched.
OE_COLD const OEFieldRow* LocateByScan(const OEAggregateDesc& d, OETagID tag, unsigned short version,
                                       int& bit) {
    bit = ScanBit(d, tag, version);
    for (unsigned short i = 0; i < d.m_fieldCount; ++i)
        if (d.m_fields[i].m_tag == tag) return &d.m_fields[i];
    return nullptr;
}

// A tag whose first valid row does not apply at this version: a later row of it may.
OE_COLD int LaterBit(const OEAggregateDesc& d, const OEAggregateIndex::Slot* s, unsigned short version) {
    return s->m_dup ? ScanBit(d, s->m_tag, version, static_cast<unsigned short>(s->m_bit + 1)) : -1;
}

} // namespace

// Kept small, as it is inlined in every lookup: the rare cases are calls.
inline const OEFieldRow* OEAggregate::Locate(const OEAggregateDesc& d, OETagID tag, int& bit) const {
    const unsigned short version = StoredMsgSetVersion();
    const OEAggregateIndex* index = d.Index();
    if (!index) return LocateByScan(d, tag, version, bit);
    const OEAggregateIndex::Slot* s = index->Find(tag);
    if (!s) {
        bit = -1;
        return nullptr;
    }
    if (s->m_bit == 0xFF)
        bit = -1;
    else if (d.m_valid[s->m_bit].m_versionMask & version)
        bit = s->m_bit;
    else
        bit = LaterBit(d, s, version);
    return s->m_row != 0xFFFF ? &d.m_fields[s->m_row] : nullptr;
}

unsigned short OEAggregate::IsValidTag(OETagID tag) const {
    int bit;
    Locate(Describe(), tag, bit);
    return bit >= 0 ? 1 : 0;
}

unsigned short OEAggregate::RowPresentIn(const OEAggregateDesc& d, unsigned short index) const {
    const OEAggregateIndex* ix = d.Index();
    if (!ix) return ValidateTag(d.m_fields[index].m_tag);
    const unsigned k = ix->m_rowBit[index];
    if (k == 0xFF) return 0;
    if (d.m_valid[k].m_versionMask & StoredMsgSetVersion())
        return PresentBit(static_cast<unsigned short>(k)) ? 1 : 0;
    // A tag whose first row does not apply at this version may have a later row that does.
    return ix->m_rowDup[index] ? ValidateTag(d.m_fields[index].m_tag) : 0;
}

unsigned short OEAggregate::RowPresent(unsigned short index) const {
    return RowPresentIn(Describe(), index);
}

// Members own their children (OEOwnedChild, OEDataObjList), so they go with the members.
OEAggregate::~OEAggregate() {}

OEOwnedChild::~OEOwnedChild() {
    delete m_obj;
}

void OEAggregate::DeleteChildren() {
    const OEAggregateDesc& d = Describe();
    for (unsigned short i = 0; i < d.m_fieldCount; ++i) {
        const OEFieldRow* row = &d.m_fields[i];
        if (row->m_kind == OEFK_CHILD) {
            OEDataObj** slot = static_cast<OEDataObj**>(Slot(row));
            delete *slot;
            *slot = nullptr;
        } else if (row->m_kind == OEFK_LIST) {
            static_cast<OEDataObjList*>(Slot(row))->DeleteAll();
        }
    }
}

unsigned short OEAggregate::GetArrayOfValidTags(OEArrayOfTags& tags) const {
    const OEAggregateDesc& d = Describe();
    tags.Set(d.m_valid, d.m_validCount);
    return 1;
}

unsigned short OEAggregate::GetArrayOfRequiredTags(OEArrayOfTags& tags) const {
    const OEAggregateDesc& d = Describe();
    tags.Set(d.m_required, d.m_requiredCount);
    return 1;
}

const OEFieldRow* OEAggregate::FindRow(OETagID tag) const {
    int bit;
    return Locate(Describe(), tag, bit);
}

OEParseStatus OEAggregate::HandleTagStart(const OETagDictionaryEntry* entry) {
    if (!entry) return OEPS_INVALID;
    int bit;
    const OEFieldRow* row = Locate(Describe(), entry->m_id, bit);
    if (!row || (row->m_kind != OEFK_CHILD && row->m_kind != OEFK_LIST) || bit < 0) return OEPS_INVALID;
    return StartChild(row, entry);
}

OEParseStatus OEAggregate::StartChild(const OEFieldRow* row, const OETagDictionaryEntry* entry) {
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return OEPS_NORESOURCE;
    if (row->m_kind == OEFK_CHILD) {
        OEDataObj** slot = static_cast<OEDataObj**>(Slot(row));
        if (*slot) {
            OELogParseWarning(OEPW_EXTRAAGG, "", "", entry->m_id, this);
            SetChildObj(row->m_tag, nullptr);
        }
        OEDataObj* child = row->m_make(factory, GetMsgSetVersion());
        if (!child) {
            OEThreadState::SetErrorCode(OETE_OUTOFMEMORY);
            return OEPS_NORESOURCE;
        }
        *slot = child;
        return PushAndSetObject(child, entry->m_id);
    }
    OEDataObj* child = row->m_make(factory, GetMsgSetVersion());
    if (!child) {
        OEThreadState::SetErrorCode(OETE_OUTOFMEMORY);
        return OEPS_NORESOURCE;
    }
    OEDataObjList* list = static_cast<OEDataObjList*>(Slot(row));
    if (!list->Append(child)) {
        delete child;
        return OEPS_NORESOURCE;
    }
    return PushAndSetObject(child, entry->m_id);
}

OEParseStatus OEAggregate::PushAndSetObject(OEDataObj* child, OETagID tag) {
    if (!child) return OEPS_NORESOURCE;
    if (tag != OETAG_NONE) {
        child->SetType(tag);
        int bit;
        Locate(Describe(), tag, bit);
        if (bit < 0) return OEPS_INVALID;
        SetPresentBit(static_cast<unsigned short>(bit));
    }
    return OEDataObj::PushAndSetObject(child, OETAG_NONE); // version and parser, as always
}

unsigned short OEAggregate::RowApplies(unsigned short index) const {
    return IsValidTag(Describe().m_fields[index].m_tag);
}

unsigned short OEAggregate::SetFromText(OETagID tag, const OEString& text) {
    int bit;
    const OEFieldRow* row = Locate(Describe(), tag, bit);
    if (!row || bit < 0) return 0;
    return StoreText(row, bit, text);
}

namespace {

// A second value for a field already present converts through a copy, so that a refused text
// leaves the old value. Out of line: the common first value needs no temporary.
#if defined(__GNUC__)
#define OE_NOINLINE __attribute__((noinline))
#else
#define OE_NOINLINE
#endif
OE_NOINLINE bool ReplaceAmount(OEPrecisionInteger& field, const char* text) {
    OEPrecisionInteger value;
    if (!value.ConvertStringToOEPrecisionInteger(text) || !value.IsValid()) return false;
    field = value;
    return true;
}

OE_NOINLINE bool ReplaceDateTime(OEDateTime& field, const char* text) {
    OEDateTime value;
    if (!value.ConvertStringToOEDateTime(text)) return false;
    field = value;
    return true;
}
#undef OE_NOINLINE

} // namespace

inline unsigned short OEAggregate::StoreString(const OEFieldRow* row, int bit, const OEString& text) {
    // Every field string keeps its own limit, whatever its class.
    OEString* str = static_cast<OEString*>(Slot(row));
    if (!str->AssignText(text)) return 3; // no memory for the value
    if (str->ExceedsSpecLength()) OELogParseWarning(OEPW_TOOLONG, text.c_str(), "", row->m_tag, this);
    SetPresentBit(static_cast<unsigned short>(bit));
    return 1;
}

// Inlined in HandleTagElement, the parse's caller, to spare a call per element.
OE_ALWAYS_INLINE unsigned short OEAggregate::StoreText(const OEFieldRow* row, int bit, const OEString& text) {
    const OETagID tag = row->m_tag;
    const unsigned short mark = static_cast<unsigned short>(bit);
    const OEFieldKind kind = row->m_kind;
    if (kind == OEFK_TEXT) return StoreString(row, bit, text);
    void* slot = Slot(row);
    const char* s = text.c_str();
    // The kinds of a statement's lines are tested one after the other, not through a jump table:
    // separate branches follow the order of a record's elements, one indirect jump does not.
    // A value not yet present converts in place (its field is not read while unmarked); one that
    // is present converts through a copy, so that a refused text leaves the old value.
    if (kind == OEFK_DATETIME) {
        OEDateTime* field = static_cast<OEDateTime*>(slot);
        if (PresentBit(mark) ? ReplaceDateTime(*field, s) : field->ConvertStringToOEDateTime(s) != 0) {
            SetPresentBit(mark);
            return 1;
        }
    } else if (kind == OEFK_AMOUNT) {
        OEPrecisionInteger* field = static_cast<OEPrecisionInteger*>(slot);
        if (PresentBit(mark) ? ReplaceAmount(*field, s)
                             : field->ConvertStringToOEPrecisionInteger(s) && field->IsValid()) {
            SetPresentBit(mark);
            return 1;
        }
    } else if (kind == OEFK_ENUM) {
        int keyword = MatchKeyword(row->m_keywords, s, text.GetStrLength());
        if (keyword >= 0) {
            *static_cast<unsigned short*>(slot) = static_cast<unsigned short>(keyword);
            SetPresentBit(mark);
            return 1;
        }
    } else {
        switch (kind) {
        case OEFK_TEXTLIST:
            return AppendText(tag, text);
        case OEFK_BOOL: {
            if (std::strcmp(s, "Y") != 0 && std::strcmp(s, "N") != 0) break;
            *static_cast<unsigned short*>(slot) = s[0] == 'Y' ? 1 : 0;
            SetPresentBit(mark);
            return 1;
        }
        case OEFK_USHORT:
        case OEFK_ULONG:
        case OEFK_SLONG: {
            long long value = 0;
            if (!ParseLong(s, kind == OEFK_SLONG, value)) break;
            if (kind == OEFK_USHORT) {
                if (value > 65535) {
                    OELogParseWarning(OEPW_OUTOFRANGE, s, "", tag, this);
                    return 0;
                }
                *static_cast<unsigned short*>(slot) = static_cast<unsigned short>(value);
            } else if (kind == OEFK_ULONG) {
                *static_cast<unsigned long*>(slot) = static_cast<unsigned long>(value);
            } else {
                if (value > 2147483647LL || value < -2147483648LL) {
                    OELogParseWarning(OEPW_OUTOFRANGE, s, "", tag, this);
                    return 0;
                }
                *static_cast<long*>(slot) = static_cast<long>(value);
            }
            SetPresentBit(mark);
            return 1;
        }
        default:
            return 0;
        }
    }
    OELogParseWarning(OEPW_BADFORMAT, s, "", tag, this);
    return 0;
}

OEParseStatus OEAggregate::HandleTagElement(const OETagDictionaryEntry* entry, const OEString& value) {
    if (!entry) return OEPS_INVALID;
    int bit;
    const OEFieldRow* row = Locate(Describe(), entry->m_id, bit);
    if (!row || row->m_kind == OEFK_CHILD || row->m_kind == OEFK_LIST) return OEPS_INVALID;
    if (bit >= 0) StoreText(row, bit, value);
    return OEPS_OK;
}

unsigned short OEAggregate::SetText(OETagID tag, const OEString& value) {
    int bit;
    const OEFieldRow* row = Locate(Describe(), tag, bit);
    if (!row || row->m_kind != OEFK_TEXT || bit < 0) return 0;
    OEString* str = static_cast<OEString*>(Slot(row));
    unsigned short spec = str->SpecLength();
    *str = value;
    str->SetSpecLength(spec);
    SetPresentBit(static_cast<unsigned short>(bit));
    return 1;
}

unsigned short OEAggregate::SetAmount(OETagID tag, const OEPrecisionInteger& value) {
    int bit;
    const OEFieldRow* row = Locate(Describe(), tag, bit);
    if (!row || row->m_kind != OEFK_AMOUNT || bit < 0) return 0;
    *static_cast<OEPrecisionInteger*>(Slot(row)) = value;
    SetPresentBit(static_cast<unsigned short>(bit));
    return 1;
}

unsigned short OEAggregate::SetDateTime(OETagID tag, const OEDateTime& value) {
    int bit;
    const OEFieldRow* row = Locate(Describe(), tag, bit);
    if (!row || row->m_kind != OEFK_DATETIME || bit < 0) return 0;
    *static_cast<OEDateTime*>(Slot(row)) = value;
    SetPresentBit(static_cast<unsigned short>(bit));
    return 1;
}

unsigned short OEAggregate::SetNumber(OETagID tag, unsigned long value) {
    int bit;
    const OEFieldRow* row = Locate(Describe(), tag, bit);
    if (!row || bit < 0) return 0;
    switch (row->m_kind) {
    case OEFK_ENUM:
        if (!row->m_keywords || value >= row->m_keywords->m_count) return 0;
        *static_cast<unsigned short*>(Slot(row)) = static_cast<unsigned short>(value);
        break;
    case OEFK_BOOL:
        *static_cast<unsigned short*>(Slot(row)) = value ? 1 : 0;
        break;
    case OEFK_USHORT:
        if (value > 65535) return 0;
        *static_cast<unsigned short*>(Slot(row)) = static_cast<unsigned short>(value);
        break;
    case OEFK_ULONG:
        *static_cast<unsigned long*>(Slot(row)) = value;
        break;
    default:
        return 0;
    }
    SetPresentBit(static_cast<unsigned short>(bit));
    return 1;
}

unsigned short OEAggregate::SetSigned(OETagID tag, long value) {
    int bit;
    const OEFieldRow* row = Locate(Describe(), tag, bit);
    if (!row || row->m_kind != OEFK_SLONG || bit < 0) return 0;
    *static_cast<long*>(Slot(row)) = value;
    SetPresentBit(static_cast<unsigned short>(bit));
    return 1;
}

unsigned short OEAggregate::SetChildObj(OETagID tag, OEDataObj* child) {
    const OEFieldRow* row = FindRow(tag);
    if (!row || row->m_kind != OEFK_CHILD) return 0;
    OEDataObj** slot = static_cast<OEDataObj**>(Slot(row));
    const OEAggregateDesc& d = Describe();
    const OEFieldRow* markRow = row;
    for (unsigned short i = 0; child && i < d.m_fieldCount; ++i) {
        const OEFieldRow* other = &d.m_fields[i];
        if (other->m_kind == OEFK_CHILD && Slot(other) == slot && other->m_tag == child->GetType())
            markRow = other;
    }
    // A child whose tag does not apply at this version is refused; the caller keeps it.
    if (child && !IsValidTag(markRow->m_tag)) return 0;
    if (*slot != child) delete *slot;
    *slot = nullptr;
    for (unsigned short i = 0; i < d.m_fieldCount; ++i) {
        const OEFieldRow* other = &d.m_fields[i];
        if (other->m_kind == OEFK_CHILD && Slot(other) == slot && ValidateTag(other->m_tag))
            ClearTag(other->m_tag);
    }
    if (!child) return 1;
    *slot = child;
    if (child->GetType() == 0) child->SetType(markRow->m_tag);
    if (GetMsgSetVersion() && !child->GetMsgSetVersion()) child->SetMsgSetVersion(GetMsgSetVersion());
    return SetTag(markRow->m_tag);
}

OEDataObj* OEAggregate::DisconnectChildObj(OETagID tag) {
    const OEFieldRow* row = FindRow(tag);
    if (!row || row->m_kind != OEFK_CHILD) return nullptr;
    OEDataObj** slot = static_cast<OEDataObj**>(Slot(row));
    OEDataObj* child = *slot;
    if (!child) return nullptr;
    *slot = nullptr;
    const OEAggregateDesc& d = Describe();
    for (unsigned short i = 0; i < d.m_fieldCount; ++i) {
        const OEFieldRow* other = &d.m_fields[i];
        if (other->m_kind == OEFK_CHILD && Slot(other) == slot && ValidateTag(other->m_tag))
            ClearTag(other->m_tag);
    }
    return child;
}

unsigned short OEAggregate::AppendToList(OETagID tag, OEDataObj* element) {
    const OEFieldRow* row = FindRow(tag);
    if (!row || row->m_kind != OEFK_LIST || !element) return 0;
    if (!static_cast<OEDataObjList*>(Slot(row))->Append(element)) return 0;
    if (element->GetType() == 0) element->SetType(tag);
    if (GetMsgSetVersion() && !element->GetMsgSetVersion()) element->SetMsgSetVersion(GetMsgSetVersion());
    SetTag(tag);
    return 1;
}

const OEString* OEAggregate::GetText(OETagID tag) const {
    int bit;
    const OEFieldRow* row = Locate(Describe(), tag, bit);
    if (!row || row->m_kind != OEFK_TEXT || bit < 0 || !PresentBit(static_cast<unsigned short>(bit)))
        return nullptr;
    return static_cast<const OEString*>(Slot(row));
}

const OEPrecisionInteger* OEAggregate::GetAmount(OETagID tag) const {
    int bit;
    const OEFieldRow* row = Locate(Describe(), tag, bit);
    if (!row || row->m_kind != OEFK_AMOUNT || bit < 0 || !PresentBit(static_cast<unsigned short>(bit)))
        return nullptr;
    return static_cast<const OEPrecisionInteger*>(Slot(row));
}

const OEDateTime* OEAggregate::GetDateTime(OETagID tag) const {
    int bit;
    const OEFieldRow* row = Locate(Describe(), tag, bit);
    if (!row || row->m_kind != OEFK_DATETIME || bit < 0 || !PresentBit(static_cast<unsigned short>(bit)))
        return nullptr;
    return static_cast<const OEDateTime*>(Slot(row));
}

unsigned long OEAggregate::GetNumber(OETagID tag) const {
    int bit;
    const OEFieldRow* row = Locate(Describe(), tag, bit);
    if (!row || bit < 0 || !PresentBit(static_cast<unsigned short>(bit))) return 0;
    switch (row->m_kind) {
    case OEFK_ENUM:
    case OEFK_BOOL:
    case OEFK_USHORT:
        return *static_cast<const unsigned short*>(Slot(row));
    case OEFK_ULONG:
        return *static_cast<const unsigned long*>(Slot(row));
    default:
        return 0;
    }
}

long OEAggregate::GetSigned(OETagID tag) const {
    int bit;
    const OEFieldRow* row = Locate(Describe(), tag, bit);
    if (!row || row->m_kind != OEFK_SLONG || bit < 0 || !PresentBit(static_cast<unsigned short>(bit)))
        return 0;
    return *static_cast<const long*>(Slot(row));
}

OEDataObj* OEAggregate::GetChildObj(OETagID tag) const {
    const OEFieldRow* row = FindRow(tag);
    if (!row || row->m_kind != OEFK_CHILD) return nullptr;
    OEDataObj* child = *static_cast<OEDataObj**>(Slot(row));
    return child && child->GetType() == tag ? child : nullptr;
}

OEDataObjList* OEAggregate::GetList(OETagID tag) const {
    const OEFieldRow* row = FindRow(tag);
    if (!row || row->m_kind != OEFK_LIST) return nullptr;
    return static_cast<OEDataObjList*>(Slot(row));
}

OEParseStatus OEAggregate::AdoptListChild(OEDataObj* parent, OEDataObjList& list, OEDataObj* child,
                                          OETagID tag) {
    if (!child) {
        OEThreadState::SetErrorCode(OETE_OUTOFMEMORY);
        return OEPS_NORESOURCE;
    }
    if (!list.Append(child)) {
        delete child;
        return OEPS_INVALID;
    }
    return parent->PushAndSetObject(child, tag);
}

int OEAggregate::BuildEach(OEDataObj* parent, OEBuilder* builder, const OEDataObjList& list) {
    for (unsigned short i = 0; i < list.Entries(); ++i) {
        OEDataObj* child = list.Get(i);
        if (!child) continue;
        int status = child->BuildObject(builder, OETAG_NONE);
        if (status != OEBS_OK) {
            builder->SetFailedObject(parent);
            return status;
        }
    }
    return OEBS_OK;
}

OEBuildStatus OEAggregate::Fail(OEBuilder* builder, OEBuildStatus status) {
    if (status != OEBS_OK) builder->SetFailedObject(this);
    return status;
}

OEBuildStatus OEAggregate::BuildRow(OEBuilder* builder, const OEFieldRow* row) {
    if (row->m_kind != OEFK_LIST) {
        int bit;
        Locate(Describe(), row->m_tag, bit);
        if (bit < 0 || !PresentBit(static_cast<unsigned short>(bit))) return OEBS_OK;
    }
    return BuildPresentRow(builder, row);
}

OEBuildStatus OEAggregate::BuildPresentRow(OEBuilder* builder, const OEFieldRow* row) {
    if (row->m_kind != OEFK_ENUM) return BuildRowWith(builder, row, nullptr);
    // The row's writer from the index when the row is one of this class's own.
    const OEAggregateDesc& d = Describe();
    const OEAggregateIndex* ix = d.Index();
    const std::uintptr_t at = reinterpret_cast<std::uintptr_t>(row),
                         first = reinterpret_cast<std::uintptr_t>(d.m_fields);
    if (ix && at >= first && at < first + d.m_fieldCount * sizeof(OEFieldRow))
        return BuildRowWith(builder, row, ix->m_rowWriter[(at - first) / sizeof(OEFieldRow)]);
    return BuildRowWith(builder, row, EnumWriterFor(row->m_keywords));
}

namespace {

// Writes an element row (any kind but a child or a list) whose value is at `slot`; the caller
// records the failure. Kept apart from the child rows, which recurse, so that the common case
// saves and restores little.
OEBuildStatus WriteElementRow(OEBuilder* builder, const OEFieldRow* row, const void* slot,
                              OEEnumWriter write) {
    const OETagID tag = row->m_tag;
    OEBuildStatus status = OEBS_OK;
    switch (row->m_kind) {
    case OEFK_TEXT:
        status = builder->AddTagOEString(tag, *static_cast<const OEString*>(slot));
        break;
    case OEFK_AMOUNT:
        status = builder->AddTagOEAmount(tag, *static_cast<const OEPrecisionInteger*>(slot));
        break;
    case OEFK_DATETIME:
        status = builder->AddTagOEDateTime(tag, *static_cast<const OEDateTime*>(slot));
        break;
    case OEFK_ENUM: {
        unsigned short value = *static_cast<const unsigned short*>(slot);
        if (!row->m_keywords || value >= row->m_keywords->m_count) return OEBS_NOTEXTFORM;
        if (write) {
            status = builder->AddTagElement(tag);
            if (status == OEBS_OK) status = write(builder, value);
            if (status == OEBS_OK && builder->GetElemEndTags() == 1) status = builder->AddTagElementEnd(tag);
        } else {
            status = builder->AddTagOEKeyword(tag, row->m_keywords->m_words[value]);
        }
        break;
    }
    case OEFK_BOOL:
        status = builder->AddTagOEBoolean(tag, *static_cast<const unsigned short*>(slot));
        break;
    case OEFK_USHORT:
        status = builder->AddTagOEUShort(tag, *static_cast<const unsigned short*>(slot));
        break;
    case OEFK_ULONG:
        status = builder->AddTagOEULong(tag, *static_cast<const unsigned long*>(slot));
        break;
    case OEFK_SLONG:
        status = builder->AddTagOESLong(tag, *static_cast<const long*>(slot));
        break;
    case OEFK_TEXTLIST: {
        const OEDynamicArrayString* list = static_cast<const OEDynamicArrayString*>(slot);
        for (unsigned short i = 0; i < list->Entries() && status == OEBS_OK; ++i)
            status = builder->AddTagOEString(tag, list->GetString(i));
        break;
    }
    default:
        break;
    }
    return status;
}

} // namespace

OEBuildStatus OEAggregate::BuildRowWith(OEBuilder* builder, const OEFieldRow* row, OEEnumWriter write) {
    OETagID tag = row->m_tag;
    void* slot = Slot(row);
    if (row->m_kind == OEFK_CHILD) {
        OEDataObj* child = *static_cast<OEDataObj**>(slot);
        if (!child || child->GetType() != tag) return OEBS_OK;
        return Fail(builder, static_cast<OEBuildStatus>(child->BuildObject(builder, tag)));
    }
    if (row->m_kind == OEFK_LIST) {
        OEDataObjList* list = static_cast<OEDataObjList*>(slot);
        for (unsigned short i = 0; i < list->Entries(); ++i) {
            OEDataObj* child = list->Get(i);
            if (!child) continue;
            OEBuildStatus status = static_cast<OEBuildStatus>(child->BuildObject(builder, tag));
            if (status != OEBS_OK) return Fail(builder, status);
        }
        return OEBS_OK;
    }
    OEBuildStatus status = WriteElementRow(builder, row, slot, write);
    if (status != OEBS_OK) builder->SetFailedObject(this);
    return status;
}

int OEAggregate::Build(OEBuilder* builder) {
    const OEAggregateDesc& d = Describe();
    const OEAggregateIndex* ix = d.Index();
    const unsigned short version = StoredMsgSetVersion();
    if (ix && ix->m_bitRows) {
        // The rows to write, found from the set presence bits rather than by testing every row
        // (most rows of a large aggregate are absent): the union of their row sets is already in
        // build order.
        OEAggregateIndex::RowSet rows;
        for (unsigned w = 0; w < OEAggregateIndex::kRowWords; ++w) rows[w] = ix->m_special[w];
        for (unsigned short w = 0; w < 3; ++w) {
            for (std::uint32_t bits = GetPresentWord(w); bits; bits &= bits - 1) {
                const unsigned k = w * 32u + static_cast<unsigned>(__builtin_ctz(bits));
                if (k >= ix->m_bitCount || !(d.m_valid[k].m_versionMask & version)) continue;
                for (unsigned i = 0; i < OEAggregateIndex::kRowWords; ++i) rows[i] |= ix->m_bitRows[k][i];
            }
        }
        for (unsigned w = 0; w < OEAggregateIndex::kRowWords; ++w) {
            for (std::uint64_t set = rows[w]; set; set &= set - 1) {
                const unsigned i = w * 64u + static_cast<unsigned>(__builtin_ctzll(set));
                const OEFieldRow* row = &d.m_fields[i];
                // A tag repeated in the valid table: its mark may be any of its rows' bits.
                if (row->m_kind != OEFK_LIST && ix->m_rowDup[i] && !ValidateTag(row->m_tag)) continue;
                OEBuildStatus status;
                if (row->m_kind == OEFK_CHILD || row->m_kind == OEFK_LIST) {
                    status = BuildRowWith(builder, row, ix->m_rowWriter[i]);
                } else if ((status = WriteElementRow(builder, row, Slot(row), ix->m_rowWriter[i])) !=
                           OEBS_OK) {
                    builder->SetFailedObject(this);
                }
                if (status != OEBS_OK) return status;
            }
        }
        return OEBS_OK;
    }
    for (unsigned short i = 0; i < d.m_fieldCount; ++i) {
        const OEFieldRow* row = &d.m_fields[i];
        // Absent rows are skipped here, by their presence bit, before any other work. A clear
        // bit is an absent row unless a later valid row of the same tag may own the mark.
        if (row->m_kind != OEFK_LIST) {
            if (!ix) {
                if (!ValidateTag(row->m_tag)) continue;
            } else {
                const unsigned k = ix->m_rowBit[i];
                if (k == 0xFF) continue;
                const bool applies = (d.m_valid[k].m_versionMask & version) != 0;
                if (!applies || !PresentBit(static_cast<unsigned short>(k))) {
                    if (applies || !ix->m_rowDup[i] || !ValidateTag(row->m_tag)) continue;
                }
            }
        }
        OEBuildStatus status = BuildPresentRow(builder, row);
        if (status != OEBS_OK) return status;
    }
    return OEBS_OK;
}

OEDataObj* OEAggregate::GetChild(unsigned short index) const {
    const OEAggregateDesc& d = Describe();
    for (unsigned short i = 0; i < d.m_fieldCount; ++i) {
        const OEFieldRow* row = &d.m_fields[i];
        if (row->m_kind == OEFK_CHILD) {
            OEDataObj* child = *static_cast<OEDataObj**>(Slot(row));
            if (!child || child->GetType() != row->m_tag) continue;
            if (index == 0) return child;
            --index;
        } else if (row->m_kind == OEFK_LIST) {
            OEDataObjList* list = static_cast<OEDataObjList*>(Slot(row));
            if (index < list->Entries()) return list->Get(index);
            index = static_cast<unsigned short>(index - list->Entries());
        }
    }
    return nullptr;
}

unsigned short OEAggregate::GetNumberOfChildren() const {
    const OEAggregateDesc& d = Describe();
    unsigned short n = 0;
    for (unsigned short i = 0; i < d.m_fieldCount; ++i) {
        const OEFieldRow* row = &d.m_fields[i];
        if (row->m_kind == OEFK_CHILD) {
            OEDataObj* child = *static_cast<OEDataObj**>(Slot(row));
            if (child && child->GetType() == row->m_tag) ++n;
        } else if (row->m_kind == OEFK_LIST) {
            n = static_cast<unsigned short>(n + static_cast<OEDataObjList*>(Slot(row))->Entries());
        }
    }
    return n;
}

unsigned short OEAggregate::DeepCopyFrom(const OEAggregate* other) {
    if (!other || other == this) return other ? 1 : 0;
    const OEAggregateDesc& d = Describe();
    if (&other->Describe() != &d) return 0;
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return 0;
    DeleteChildren();
    for (unsigned short i = 0; i < d.m_fieldCount; ++i)
        if (!CopyRow(&d.m_fields[i], other, factory)) return 0;
    if (!CopyExtraFrom(other)) return 0;
    return CopyBaseMembersFrom(other);
}

unsigned short OEAggregate::CopyRow(const OEFieldRow* row, const OEAggregate* other,
                                    OEDataObjFactory* factory) {
    void* to = Slot(row);
    const void* from = other->Slot(row);
    switch (row->m_kind) {
    case OEFK_TEXT:
        *static_cast<OEString*>(to) = *static_cast<const OEString*>(from);
        break;
    case OEFK_AMOUNT:
        *static_cast<OEPrecisionInteger*>(to) = *static_cast<const OEPrecisionInteger*>(from);
        break;
    case OEFK_DATETIME:
        *static_cast<OEDateTime*>(to) = *static_cast<const OEDateTime*>(from);
        break;
    case OEFK_ENUM:
    case OEFK_BOOL:
    case OEFK_USHORT:
        *static_cast<unsigned short*>(to) = *static_cast<const unsigned short*>(from);
        break;
    case OEFK_ULONG:
        *static_cast<unsigned long*>(to) = *static_cast<const unsigned long*>(from);
        break;
    case OEFK_SLONG:
        *static_cast<long*>(to) = *static_cast<const long*>(from);
        break;
    case OEFK_TEXTLIST:
        static_cast<OEDynamicArrayString*>(to)->DeleteAll();
        if (!static_cast<OEDynamicArrayString*>(to)->DeepCopyFrom(
                *static_cast<const OEDynamicArrayString*>(from)))
            return 0;
        break;
    case OEFK_CHILD: {
        OEDataObj* src = *static_cast<OEDataObj* const*>(from);
        if (!src || src->GetType() != row->m_tag) break;
        OEAggregate* copy = static_cast<OEAggregate*>(row->m_make(factory, src->GetMsgSetVersion()));
        if (!copy) return 0;
        *static_cast<OEDataObj**>(to) = copy;
        if (!copy->DeepCopyFrom(static_cast<const OEAggregate*>(src))) return 0;
        break;
    }
    case OEFK_LIST: {
        const OEDataObjList* src = static_cast<const OEDataObjList*>(from);
        OEDataObjList* dst = static_cast<OEDataObjList*>(to);
        for (unsigned short k = 0; k < src->Entries(); ++k) {
            const OEAggregate* e = static_cast<const OEAggregate*>(src->Get(k));
            if (!e) continue;
            OEAggregate* copy = static_cast<OEAggregate*>(row->m_make(factory, e->GetMsgSetVersion()));
            if (!copy) return 0;
            if (!dst->Append(copy)) {
                delete copy;
                return 0;
            }
            if (!copy->DeepCopyFrom(e)) return 0;
        }
        break;
    }
    }
    return 1;
}

unsigned short OEAggregate::CopyExtraFrom(const OEAggregate*) {
    return 1;
}

OEDynamicArrayString* OEAggregate::GetTextList(OETagID tag) const {
    const OEFieldRow* row = FindRow(tag);
    if (!row || row->m_kind != OEFK_TEXTLIST) return nullptr;
    return static_cast<OEDynamicArrayString*>(Slot(row));
}

unsigned short OEAggregate::AppendText(OETagID tag, const OEString& value) {
    OEDynamicArrayString* list = GetTextList(tag);
    if (!list || !IsValidTag(tag)) return 0;
    if (!list->AddString(value)) return 3;
    if (value.ExceedsSpecLength()) OELogParseWarning(OEPW_TOOLONG, value.c_str(), "", tag, this);
    return SetTag(tag);
}

void OEAggregate::AmountText(const OEPrecisionInteger& value, OEString& out) {
    OEPrecisionInteger copy(value);
    unsigned short scale = copy.Decimal();
    const char* plain = static_cast<char*>(copy); // trailing zeros dropped
    std::string text = plain ? plain : "0";
    bool negative = !text.empty() && text[0] == '-';
    std::string digits = negative ? text.substr(1) : text;
    if (!digits.empty() && digits[0] == '.') digits.insert(0, "0");
    if (scale > 0 && scale < 30) {
        size_t point = digits.find('.');
        size_t have = point == std::string::npos ? 0 : digits.size() - point - 1;
        if (point == std::string::npos) digits += '.';
        while (have < scale) {
            digits += '0';
            ++have;
        }
    }
    out = ((negative ? "-" : "") + digits).c_str();
}

unsigned short OEAggregate::GetFieldText(const OEFieldRow* row, OEString& out) const {
    if (!row || row->m_kind == OEFK_CHILD || row->m_kind == OEFK_LIST || !ValidateTag(row->m_tag)) return 0;
    const void* slot = Slot(row);
    char number[32];
    switch (row->m_kind) {
    case OEFK_TEXT:
        out = *static_cast<const OEString*>(slot);
        return 1;
    case OEFK_AMOUNT:
        AmountText(*static_cast<const OEPrecisionInteger*>(slot), out);
        return 1;
    case OEFK_DATETIME:
        if (!static_cast<const OEDateTime*>(slot)->GetDateString(out)) out = "";
        return 1;
    case OEFK_ENUM: {
        unsigned short v = *static_cast<const unsigned short*>(slot);
        out = row->m_keywords && v < row->m_keywords->m_count ? row->m_keywords->m_words[v] : "?";
        return 1;
    }
    case OEFK_BOOL:
        out = *static_cast<const unsigned short*>(slot) ? "Y" : "N";
        return 1;
    case OEFK_TEXTLIST: {
        const OEDynamicArrayString* list = static_cast<const OEDynamicArrayString*>(slot);
        std::string joined;
        for (unsigned short i = 0; i < list->Entries(); ++i)
            joined += (i ? ", " : "") + std::string(list->GetString(i)->c_str());
        out = joined.c_str();
        return 1;
    }
    case OEFK_USHORT:
        std::snprintf(number, sizeof(number), "%u",
                      static_cast<unsigned>(*static_cast<const unsigned short*>(slot)));
        break;
    case OEFK_ULONG:
        std::snprintf(number, sizeof(number), "%lu", *static_cast<const unsigned long*>(slot));
        break;
    case OEFK_SLONG:
        std::snprintf(number, sizeof(number), "%ld", *static_cast<const long*>(slot));
        break;
    default:
        return 0;
    }
    out = number;
    return 1;
}

// ---------------------------------------------------------------- OEMixedList

int OEMixedList::Build(OEBuilder* builder) {
    const OEAggregateDesc& d = Describe();
    for (unsigned short i = 0; i < d.m_fieldCount; ++i) {
        if (d.m_fields[i].m_kind == OEFK_LIST) continue;
        OEBuildStatus status = BuildRow(builder, &d.m_fields[i]);
        if (status != 0) return status;
    }
    return BuildEach(this, builder, m_entries);
}

// The rows besides the lists are elements, so the entries are the only children.
OEDataObj* OEMixedList::GetChild(unsigned short index) const {
    return m_entries.Get(index);
}

unsigned short OEMixedList::GetNumberOfChildren() const {
    return m_entries.Entries();
}

unsigned short OEMixedList::DeepCopyFrom(const OEAggregate* other) {
    if (!other || other == this) return other ? 1 : 0;
    if (&other->Describe() != &Describe()) return 0;
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return 0;
    m_entries.DeleteAll();
    const OEMixedList* from = static_cast<const OEMixedList*>(other);
    for (unsigned short k = 0; k < from->m_entries.Entries(); ++k) {
        const OEAggregate* source = static_cast<const OEAggregate*>(from->m_entries.Get(k));
        const OEFieldRow* row = source ? FindRow(source->GetType()) : nullptr;
        if (!row || row->m_kind != OEFK_LIST) continue; // nothing to copy, or not a kind this list makes
        OEAggregate* copy = static_cast<OEAggregate*>(row->m_make(factory, source->GetMsgSetVersion()));
        if (!copy) return 0;
        if (!m_entries.Append(copy)) {
            delete copy;
            return 0;
        }
        if (!copy->DeepCopyFrom(source)) return 0;
    }
    const OEAggregateDesc& d = Describe();
    for (unsigned short i = 0; i < d.m_fieldCount; ++i)
        if (d.m_fields[i].m_kind != OEFK_LIST && !CopyRow(&d.m_fields[i], other, factory)) return 0;
    return CopyBaseMembersFrom(other);
}

unsigned short OEMixedList::AppendEntry(OEDataObj* entry) {
    const OEFieldRow* row = entry ? FindRow(entry->GetType()) : nullptr;
    if (!row || row->m_kind != OEFK_LIST) return 0;
    return AppendToList(entry->GetType(), entry);
}

void OEMixedList::DeleteAllEntries() {
    m_entries.DeleteAll();
    const OEAggregateDesc& d = Describe();
    for (unsigned short i = 0; i < d.m_fieldCount; ++i)
        if (d.m_fields[i].m_kind == OEFK_LIST && ValidateTag(d.m_fields[i].m_tag))
            ClearTag(d.m_fields[i].m_tag);
}
