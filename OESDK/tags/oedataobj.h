// OEDataObj: the base of every OFX aggregate object, with the protocol through which the parser
// feeds an aggregate its children and the builder asks it to write itself.
//
// Each aggregate class describes its children with two constant tables (OEArrayOfTags): the
// valid child tags and the required ones. Row k of the valid table owns bit k of the object's
// present-tag set, whatever the row's version mask, so an aggregate has at most 96 valid child
// tags. Presence, validity and the required-field checks are all computed from these tables here.
#ifndef OESDK_TAGS_OEDATAOBJ_H
#define OESDK_TAGS_OEDATAOBJ_H

#include "oeexport.h"
#include "foundation/oestatus.h"
#include "foundation/oestring.h"
#include "tags/oeheadertag.h"
#include "tags/oetagdictionary.h"
#include "tags/oetagid.h"

#include <cstddef>
#include <cstdint>
#include <new>

class OEParser;
class OEBuilder;
class OEDataObjFactory;
class ServerImpl;

// Version masks of a tag row: the row applies to an object when (mask & object version) != 0.
enum OETagVersionMask : unsigned short {
    OEVM_V1 = 0x0001,    // message-set version 1 only
    OEVM_V2 = 0x0002,    // version 2 only
    OEVM_NOTV1 = 0xFFFE, // every version but 1
    OEVM_ALL = 0xFFFF    // every version
};

// One row of an aggregate's tag table.
struct OETagRow {
    OETagID m_tag;
    unsigned short m_versionMask;
    unsigned short m_reserved; // 0
};

// A constant table of tag rows and its row count.
struct OEArrayOfTags {
    const OETagRow* m_rows = nullptr;
    unsigned short m_count = 0;

    void Set(const OETagRow* rows, unsigned short count) {
        m_rows = rows;
        m_count = count;
    }
    template <unsigned short N> void Set(const OETagRow (&rows)[N]) { Set(rows, N); }
};

class OE_API OEDataObj {
public:
    enum : unsigned short { kMaxValidTags = 96 };

    explicit OEDataObj(unsigned short msgSetVersion = 0);
    OEDataObj(const OEDataObj& other);
    OEDataObj& operator=(const OEDataObj& other);

    // Data objects live in the block pool (OEMemory::PoolAlloc): a parsed tree is made of many
    // small objects created together and usually deleted together. Every `new` of a data object,
    // the host's own subclasses included, takes this route, and `delete` gives the block back to
    // the library whichever module deletes it.
    static void* operator new(std::size_t bytes);
    static void* operator new(std::size_t bytes, const std::nothrow_t&) noexcept;
    static void operator delete(void* block) noexcept;
    static void operator delete(void* block, const std::nothrow_t&) noexcept;

    // Virtual slots, in this order.
    virtual ~OEDataObj();
    virtual OEParseStatus SetupForParsing(OEParser* parser);
    // A child aggregate starts. Base: 4 (not valid here).
    virtual OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry);
    // An element with its value. Each concrete class overrides one of the two forms (normally
    // the OEString one); the base versions only forward to each other.
    virtual OEParseStatus HandleTagElement(const OETagDictionaryEntry* entry, const char* value);
    virtual OEParseStatus HandleTagElement(const OETagDictionaryEntry* entry, const OEString& value);
    // The end tag: pops this object when it closes it (0), else logs OEPW_INVALIDENDAGG (5).
    virtual OEParseStatus HandleTagEnd(const OETagDictionaryEntry* entry);
    // One header line in front of the body. Base: 0.
    virtual OEParseStatus HandleHeader(OEHeaderTag tag, const OEString& value, OEString* name);
    // Base: empty tables, 1.
    virtual unsigned short GetArrayOfValidTags(OEArrayOfTags& tags) const;
    virtual unsigned short GetArrayOfRequiredTags(OEArrayOfTags& tags) const;
    // Writes the children (base: nothing, 0).
    virtual int Build(OEBuilder* builder);
    // Writes the whole aggregate: start tag (tag 0 = GetType()), Build, end tag.
    virtual int BuildObject(OEBuilder* builder, OETagID tag);
    // Adopts a newly created child: marks the tag, passes the version down, pushes the child on
    // the parser's stack. 3 for a null child or no parser, 4 when the tag is not valid here, 6
    // when the parser refuses to nest deeper.
    virtual OEParseStatus PushAndSetObject(OEDataObj* child, OETagID tag);
    virtual OEParseStatus ProcessResponse();
    virtual OEParseStatus ProcessRequest(const ServerImpl* server);
    virtual unsigned short AllRequiredPresent();
    // The first required tag that applies and is missing, or with `after` non-zero the next one
    // after it; 0 when there is none.
    virtual OETagID GetFirstMissingRequiredTag(OETagID after);
    virtual unsigned short IsValidTag(OETagID tag) const;
    virtual unsigned short AnyValidPresent();
    virtual unsigned short IsTagRequired(OETagID tag);
    // 1 when exactly one valid tag is present (aggregates whose children are alternatives).
    virtual unsigned short OneValidPresent();
    virtual unsigned short SetMsgSetVersion(unsigned short version);
    virtual unsigned short GetMsgSetVersion() const;
    // 1 or 2 from the last character of the aggregate's own tag name (BANKMSGSRSV1 gives 1), else 0.
    virtual unsigned short GetMsgSetVersionFromTag() const;
    virtual OETagID GetType() const;
    virtual void SetType(OETagID type);
    virtual OEDataObj* GetChild(unsigned short index) const;
    virtual unsigned short GetNumberOfChildren() const;

    // Presence marks. SetTag: 1, or 0 when the tag is not valid for this object's version.
    unsigned short SetTag(OETagID tag);
    // 1, or 0 (and OEPW_UNKNOWNTAG logged) when the tag is not valid.
    unsigned short ClearTag(OETagID tag);
    // 1 when the tag is valid and marked present.
    unsigned short ValidateTag(OETagID tag) const;
    // Copies parser, present marks, type and version. Returns 1.
    unsigned short CopyBaseMembersFrom(const OEDataObj* other);

    // The process-wide factory: made on first use (version 1, owned by the library) unless the
    // host installed one. Null (thread error 1) when memory is short.
    static OEDataObjFactory* GetFactory();
    // Installs a factory (null allowed); deletes the current one only when the library made it.
    // The host keeps ownership of what it installs. Returns 1.
    static unsigned short SetFactory(OEDataObjFactory* factory);
    static const char* GetOESDKVersion();

    // The raw present-tag words (bit k = row k of the valid table).
    std::uint32_t GetPresentWord(unsigned short index) const { return index < 3 ? m_present[index] : 0; }

protected:
    // Direct access to presence bit k (row k of the valid table, k < kMaxValidTags) and to the
    // stored message-set version, for subclasses that index their own valid table: the same
    // marks SetTag / ClearTag / ValidateTag work on, without a search of the table.
    void SetPresentBit(unsigned short k) { m_present[k / 32] |= std::uint32_t(1) << (k % 32); }
    bool PresentBit(unsigned short k) const { return (m_present[k / 32] >> (k % 32)) & 1u; }
    unsigned short StoredMsgSetVersion() const { return m_msgSetVersion; }

    void SetParser(OEParser* parser) { m_parser = parser; }
    OEParser* GetParser() const { return m_parser; }

    static OEDataObjFactory* m_factoryObj;
    static unsigned short m_factoryAllocated;

private:
    // Clears `mask` (three words) and sets the bit of the tag's row; 1, or 0 when no row with
    // that tag applies to this object's version.
    unsigned short GetBitValue(OETagID tag, std::uint32_t* mask) const;
    unsigned short IsRequiredRowMissing(const OETagRow& row) const;

    OEParser* m_parser;
    std::uint32_t m_present[3];
    OETagID m_type;
    unsigned short m_msgSetVersion;
};

#endif
