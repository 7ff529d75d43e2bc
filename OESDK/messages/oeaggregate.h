// The aggregate machinery: one descriptor table per aggregate class, one generic implementation.
//
// An aggregate class says what it is once, as data: its own tag, its valid and required child
// tables (OEArrayOfTags rows with version masks) and its field rows in build order. Each field row
// names a child tag, the kind of value stored for it and where that value lives in the object.
// OEAggregate derives from the rows everything the data-object protocol asks for: element
// dispatch (HandleTagElement), child creation (HandleTagStart), Build, DeepCopyFrom, the child walk
// (GetChild / GetNumberOfChildren) and the typed set/get helpers behind the named accessors.
//
// What data cannot say (an exclusive-or of presence marks, the sign-on credentials rule, a
// setter that deletes before it marks) is written by hand as an override in the class's own
// file. docs/aggregates.md shows how to add a class.
#ifndef OESDK_MESSAGES_OEAGGREGATE_H
#define OESDK_MESSAGES_OEAGGREGATE_H
#include "oeexport.h"
#include "foundation/oedynarr.h"
#include "foundation/oestring.h"
#include "foundation/oeprecision.h"
#include "foundation/oedatetime.h"
#include "foundation/oedataconv.h"
#include "tags/oedataobj.h"
#include "tags/oedatafactory.h"

#include <atomic>

class OEBuilder;

// What a field row stores.
enum OEFieldKind : unsigned char {
    OEFK_TEXT = 0, // an OEString (or a bounded subclass: its spec length is the bound)
    OEFK_AMOUNT,   // an OEPrecisionInteger
    OEFK_DATETIME, // an OEDateTime
    OEFK_ENUM,     // an unsigned short index into the row's keyword table
    OEFK_BOOL,     // an unsigned short flag written "Y" / "N"
    OEFK_USHORT,   // an unsigned short number
    OEFK_SLONG,    // a long
    OEFK_ULONG,    // an unsigned long
    OEFK_CHILD,    // one owned child aggregate (OEOwnedChild); rows may share one slot
    OEFK_LIST,     // an owned, ordered list of child aggregates (OEPtrArray<OEDataObj>)
    OEFK_TEXTLIST  // a repeated element: an OEDynamicArrayString, one element per entry
};

// One field row. `m_member` hands out the address of the value inside a given object; a captureless
// lambda does the cast (see OE_FIELD in docs/aggregates.md). `m_make` creates a child through the
// factory (child and list rows only).
struct OEFieldRow {
    OETagID m_tag;
    OEFieldKind m_kind;
    void* (*m_member)(OEDataObj* object);
    const OEKeywordTable* m_keywords;
    OEDataObj* (*m_make)(OEDataObjFactory* factory, unsigned short version);
};

struct OEAggregateIndex;

// The descriptor of one aggregate class.
struct OEAggregateDesc {
    OETagID m_type;
    const OETagRow* m_valid;
    unsigned short m_validCount;
    const OETagRow* m_required;
    unsigned short m_requiredCount;
    const OEFieldRow* m_fields; // in build order
    unsigned short m_fieldCount;
    // Built on first use and kept for the process: a tag -> (field row, presence bit) hash index
    // and, per field row, the position of its tag in the valid table (its presence bit) or 0xFF.
    // Parsing, building and the typed accessors find a tag with one probe instead of searching
    // the tables. Null only when memory was short (callers then search the tables).
    mutable std::atomic<const OEAggregateIndex*> m_index{nullptr};
    const OEAggregateIndex* Index() const {
        const OEAggregateIndex* index = m_index.load(std::memory_order_acquire);
        return index ? index : MakeIndex();
    }
    const OEAggregateIndex* MakeIndex() const;
    const unsigned char* Bits() const;
};

// Address of a member of class C, as an OEFieldRow wants it.
#define OE_MEMBER(C, m) [](OEDataObj* o) -> void* { return &static_cast<C*>(o)->m; }
// A creator that asks the factory for a new object, as an OEFieldRow wants it.
#define OE_MAKE(op) [](OEDataObjFactory* f, unsigned short v) -> OEDataObj* { return f->op(v); }
// A descriptor over the class's static tables (valid, required, fields).
#define OE_DESC(tag, valid, required, fields)                                                                \
    OEAggregateDesc {                                                                                        \
        tag, valid, static_cast<unsigned short>(sizeof(valid) / sizeof(valid[0])), required,                 \
            static_cast<unsigned short>(sizeof(required) / sizeof(required[0])), fields,                     \
            static_cast<unsigned short>(sizeof(fields) / sizeof(fields[0]))                                  \
    }
// The same for a class without required rows, whose AllRequiredPresent states the whole rule (the
// required table is empty: it points at the valid rows with a count of 0).
#define OE_DESC_NO_REQUIRED(tag, valid, fields)                                                              \
    OEAggregateDesc {                                                                                        \
        tag, valid, static_cast<unsigned short>(sizeof(valid) / sizeof(valid[0])), valid, 0, fields,         \
            static_cast<unsigned short>(sizeof(fields) / sizeof(fields[0]))                                  \
    }

// The constructor and Describe of an aggregate class whose shape is the descriptor `desc`.
#define OE_AGGREGATE_DEFINE(C, Base, desc, tag)                                                              \
    C::C(unsigned short version) : Base(version) {                                                           \
        SetType(tag);                                                                                        \
    }                                                                                                        \
    const OEAggregateDesc& C::Describe() const {                                                             \
        return desc;                                                                                         \
    }

// The owned list of a list row. Its growth step keeps up with its length (half its entries once
// it holds more than ten), so reading a statement of many thousand transactions does not move
// the list over and over.
class OE_API OEDataObjList : public OEPtrArray<OEDataObj> {
public:
    using OEPtrArray<OEDataObj>::OEPtrArray;
    unsigned short Append(OEDataObj* element) {
        const unsigned short n = Entries();
        if (n >= Capacity() && n > 10 && GrowBy() < n / 2) SetGrowBy(static_cast<unsigned short>(n / 2));
        return OEPtrArray<OEDataObj>::Append(element);
    }
};

// The storage of a child row: one owned child, deleted with the member. (Standard layout with the
// pointer first, so the slot's address is also the address of the pointer.)
struct OE_API OEOwnedChild {
    OEDataObj* m_obj = nullptr;
    OEOwnedChild() = default;
    ~OEOwnedChild();
    OEOwnedChild(const OEOwnedChild&) = delete;
    OEOwnedChild& operator=(const OEOwnedChild&) = delete;
    OEDataObj* get() const { return m_obj; }
};

class OE_API OEAggregate : public OEDataObj {
public:
    explicit OEAggregate(unsigned short version = 0);
    ~OEAggregate() override;
    OEAggregate(const OEAggregate&) = delete;
    OEAggregate& operator=(const OEAggregate&) = delete;

    // The class's descriptor.
    virtual const OEAggregateDesc& Describe() const = 0;

    // The valid table is always the descriptor's: the index of the descriptor answers for it.
    unsigned short GetArrayOfValidTags(OEArrayOfTags& tags) const final;
    unsigned short IsValidTag(OETagID tag) const final;
    unsigned short GetArrayOfRequiredTags(OEArrayOfTags& tags) const override;
    OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry) override;
    OEParseStatus HandleTagElement(const OETagDictionaryEntry* entry, const OEString& value) override;
    using OEDataObj::HandleTagElement;
    // The base protocol, with the tag marked through the descriptor's index.
    OEParseStatus PushAndSetObject(OEDataObj* child, OETagID tag) override;
    int Build(OEBuilder* builder) override;
    OEDataObj* GetChild(unsigned short index) const override;
    unsigned short GetNumberOfChildren() const override;

    // Copies every field and child of `other`, which must be of the same class (children are made
    // through the factory), then calls CopyExtraFrom. 1 on success; 0 for another class, no
    // factory or no memory.
    virtual unsigned short DeepCopyFrom(const OEAggregate* other);
    // Hook: members that no field row describes (a hand-written list, say). Base: 1.
    virtual unsigned short CopyExtraFrom(const OEAggregate* other);

    // The text form of a present element row (as the builder writes it, before escaping): 1, or
    // 0 for a child row or an element that is not present. For tools that show a tree.
    unsigned short GetFieldText(const OEFieldRow* row, OEString& out) const;
    // An exact decimal as written with its own scale (trailing zeros kept, a zero before the
    // point): -25.00 stays "-25.00", .5 becomes "0.5".
    static void AmountText(const OEPrecisionInteger& value, OEString& out);

protected:
    // The row for a tag, or null.
    const OEFieldRow* FindRow(OETagID tag) const;
    // Where a row's value lives in this object.
    void* Slot(const OEFieldRow* row) const { return row->m_member(const_cast<OEAggregate*>(this)); }

    // Typed setters behind the named accessors: store, mark the tag and return 1; 0 when the tag
    // does not apply at this version. The text form converts first: a refused value is logged
    // (OEPW_BADFORMAT with the tag) and leaves the mark clear.
    unsigned short SetFromText(OETagID tag, const OEString& text);
    unsigned short SetText(OETagID tag, const OEString& value);
    unsigned short SetAmount(OETagID tag, const OEPrecisionInteger& value);
    unsigned short SetDateTime(OETagID tag, const OEDateTime& value);
    unsigned short SetNumber(OETagID tag, unsigned long value); // enum, bool, ushort, ulong
    unsigned short SetSigned(OETagID tag, long value);
    // Replaces the object in a child slot (the old one is deleted, the marks of every row that
    // shares the slot are cleared). A null child only clears. The new child is marked under its
    // own type when that is one of the slot's tags, else under `tag`.
    unsigned short SetChildObj(OETagID tag, OEDataObj* child);
    // Hands the child in a slot back to the caller (not deleted), clearing its marks.
    OEDataObj* DisconnectChildObj(OETagID tag);
    // Appends to a list row and marks it; the list owns the element afterwards.
    unsigned short AppendToList(OETagID tag, OEDataObj* element);

    // Typed getters: the stored value, or null when the tag is not marked.
    const OEString* GetText(OETagID tag) const;
    const OEPrecisionInteger* GetAmount(OETagID tag) const;
    const OEDateTime* GetDateTime(OETagID tag) const;
    unsigned long GetNumber(OETagID tag) const; // 0 when not marked
    long GetSigned(OETagID tag) const;
    OEDataObj* GetChildObj(OETagID tag) const;
    OEDataObjList* GetList(OETagID tag) const;
    OEDynamicArrayString* GetTextList(OETagID tag) const;
    // Appends one entry to a repeated element and marks it.
    unsigned short AppendText(OETagID tag, const OEString& value);

    // Builds one row (element or child) when it is present; the generic Build calls it per row.
    // Subclasses that write something in between override Build and call this.
    OEBuildStatus BuildRow(OEBuilder* builder, const OEFieldRow* row);
    // The same for a row already known to be present.
    OEBuildStatus BuildPresentRow(OEBuilder* builder, const OEFieldRow* row);
    // 1 when field row `index` of this class is present (the same answer as ValidateTag).
    unsigned short RowPresent(unsigned short index) const;
    // 1 when the tag of field row `index` applies at this object's version (as IsValidTag).
    unsigned short RowApplies(unsigned short index) const;
    // Records this object as the failed one (if none is yet) and returns the status.
    OEBuildStatus Fail(OEBuilder* builder, OEBuildStatus status);
    // Creates a child for a start tag through the factory and pushes it (the protocol of
    // HandleTagStart for child and list rows).
    OEParseStatus StartChild(const OEFieldRow* row, const OETagDictionaryEntry* entry);
    // Deletes every child and list element.
    void DeleteChildren();
    // Copies one row's value (a child or list as deep copies made by the factory) from other, an
    // object of the same class; 0 when memory is short.
    unsigned short CopyRow(const OEFieldRow* row, const OEAggregate* other, OEDataObjFactory* factory);

private:
    // One probe of the descriptor's index: the field row of `tag` (or null) and the presence bit
    // the tag owns at this object's version (or -1: the tag is not valid here), exactly what
    // FindRow and SetTag's search of the valid table give.
    const OEFieldRow* Locate(const OEAggregateDesc& d, OETagID tag, int& bit) const;
    // BuildPresentRow with the row's enumeration writer already known (null: its keyword).
    OEBuildStatus BuildRowWith(OEBuilder* builder, const OEFieldRow* row,
                               OEBuildStatus (*write)(OEBuilder* builder, unsigned short value));
    // RowPresent for a known descriptor.
    unsigned short RowPresentIn(const OEAggregateDesc& d, unsigned short index) const;
    // Converts and stores the text of element row `row` whose tag owns presence bit `bit` (>= 0).
    unsigned short StoreText(const OEFieldRow* row, int bit, const OEString& text);
    // StoreText of a text row: 1, or 3 when memory is short.
    unsigned short StoreString(const OEFieldRow* row, int bit, const OEString& text);

public:
    // Shared by the classes that keep lists of wrappers (message sets, synchronisation):
    // appends a child the factory has just made (null: out of memory, status 3) to `list` and
    // makes it the object being parsed under `parent`; a list that cannot grow gives 4 and the
    // child is deleted.
    static OEParseStatus AdoptListChild(OEDataObj* parent, OEDataObjList& list, OEDataObj* child,
                                        OETagID tag);
    // Writes every object of `list` in order; the first failure is recorded against `parent`.
    static int BuildEach(OEDataObj* parent, OEBuilder* builder, const OEDataObjList& list);
};

// An aggregate whose list rows all share one list (m_entries), so that entries of different kinds
// are written back in the order read: the security list, the investment transaction and position
// lists. Its element and child rows, if any, are written first, in field order, then every entry
// as its own kind; the child walk and DeepCopyFrom see each entry once.
class OE_API OEMixedList : public OEAggregate {
public:
    explicit OEMixedList(unsigned short version = 0) : OEAggregate(version) {}
    int Build(OEBuilder* builder) override;
    OEDataObj* GetChild(unsigned short index) const override;
    unsigned short GetNumberOfChildren() const override;
    unsigned short DeepCopyFrom(const OEAggregate* other) override;

protected:
    // Appends an entry of any kind the list has a row for; 0 for null or another kind (the
    // caller keeps it).
    unsigned short AppendEntry(OEDataObj* entry);
    // Deletes every entry and clears the marks of the list rows.
    void DeleteAllEntries();

public:
    OEDataObjList m_entries;
};

// ---- Named accessors ----
// A class states its named accessors one element a line, through the macros below: `Name` is the
// accessor's name without Get / Set, `tag` the element's tag. Each expands to inline one-liners
// over the typed helpers of OEAggregate (nothing virtual, nothing exported of its own), written
// with `this->` so that class templates over an aggregate base can use them too. An invocation
// ends with a semicolon, like a declaration.
//
// The families: a getter, the setter from the element's text (converted as the parser converts
// it: a refused text is logged and marks nothing) and the setter from the typed value.
//   OE_TEXT_ACCESSORS(Name, tag)          const OEString* GetName() const (null when absent);
//                                         SetName(const OEString&)
//   OE_DATE_ACCESSORS(Name, tag)          the same with const OEDateTime*; + SetName(const OEDateTime&)
//   OE_AMOUNT_ACCESSORS(Name, tag)        the same with const OEPrecisionInteger*; + SetName(that)
//   OE_NUMBER_ACCESSORS(Name, Type, tag)  an enumeration index, count or Y/N flag as Type (unsigned
//                                         short, unsigned long, bool or an OE... enumeration; 0 when
//                                         absent); + SetName(Type)
//   OE_CHILD_ACCESSORS(Name, Type, tag)   Type* GetName() (null when absent); SetName(Type*), which
//                                         replaces and deletes the held child (null only clears)
// The partial families OE_DATE_TEXT_ / OE_AMOUNT_TEXT_ACCESSORS (no typed setter) and
// OE_AMOUNT_VALUE_ / OE_NUMBER_VALUE_ACCESSORS (no text setter) serve the classes that offer less;
// an accessor alone is one of the pieces (OE_GET_..., OE_SET_...), and one with behaviour of its
// own is written out by hand.
#define OE_GET_TEXT(Name, tag)                                                                               \
    const OEString* Get##Name() const {                                                                      \
        return this->GetText(tag);                                                                           \
    }
#define OE_GET_DATE(Name, tag)                                                                               \
    const OEDateTime* Get##Name() const {                                                                    \
        return this->GetDateTime(tag);                                                                       \
    }
#define OE_GET_AMOUNT(Name, tag)                                                                             \
    const OEPrecisionInteger* Get##Name() const {                                                            \
        return this->GetAmount(tag);                                                                         \
    }
#define OE_GET_NUMBER(Name, Type, tag)                                                                       \
    Type Get##Name() const {                                                                                 \
        return static_cast<Type>(this->GetNumber(tag));                                                      \
    }
#define OE_GET_CHILD(Name, Type, tag)                                                                        \
    Type* Get##Name() const {                                                                                \
        return static_cast<Type*>(this->GetChildObj(tag));                                                   \
    }
#define OE_SET_FROM_TEXT(Name, tag)                                                                          \
    unsigned short Set##Name(const OEString& v) {                                                            \
        return this->SetFromText(tag, v);                                                                    \
    }
#define OE_SET_DATE(Name, tag)                                                                               \
    unsigned short Set##Name(const OEDateTime& v) {                                                          \
        return this->SetDateTime(tag, v);                                                                    \
    }
#define OE_SET_AMOUNT(Name, tag)                                                                             \
    unsigned short Set##Name(const OEPrecisionInteger& v) {                                                  \
        return this->SetAmount(tag, v);                                                                      \
    }
#define OE_SET_NUMBER(Name, Type, tag)                                                                       \
    unsigned short Set##Name(Type v) {                                                                       \
        return this->SetNumber(tag, static_cast<unsigned long>(v));                                          \
    }
#define OE_SET_CHILD(Name, Type, tag)                                                                        \
    unsigned short Set##Name(Type* v) {                                                                      \
        return this->SetChildObj(tag, v);                                                                    \
    }

#define OE_TEXT_ACCESSORS(Name, tag) OE_GET_TEXT(Name, tag) OE_SET_FROM_TEXT(Name, tag)
#define OE_DATE_ACCESSORS(Name, tag) OE_DATE_TEXT_ACCESSORS(Name, tag) OE_SET_DATE(Name, tag)
#define OE_AMOUNT_ACCESSORS(Name, tag) OE_AMOUNT_TEXT_ACCESSORS(Name, tag) OE_SET_AMOUNT(Name, tag)
#define OE_NUMBER_ACCESSORS(Name, Type, tag)                                                                 \
    OE_NUMBER_VALUE_ACCESSORS(Name, Type, tag) OE_SET_FROM_TEXT(Name, tag)
// The partial families: the getter with the text setter only, or with the typed setter only.
#define OE_DATE_TEXT_ACCESSORS(Name, tag) OE_GET_DATE(Name, tag) OE_SET_FROM_TEXT(Name, tag)
#define OE_AMOUNT_TEXT_ACCESSORS(Name, tag) OE_GET_AMOUNT(Name, tag) OE_SET_FROM_TEXT(Name, tag)
#define OE_AMOUNT_VALUE_ACCESSORS(Name, tag) OE_GET_AMOUNT(Name, tag) OE_SET_AMOUNT(Name, tag)
#define OE_NUMBER_VALUE_ACCESSORS(Name, Type, tag)                                                           \
    OE_GET_NUMBER(Name, Type, tag) OE_SET_NUMBER(Name, Type, tag)
#define OE_CHILD_ACCESSORS(Name, Type, tag) OE_GET_CHILD(Name, Type, tag) OE_SET_CHILD(Name, Type, tag)

// A list row held in the member `list` (an OEDataObjList): AppendName(Type*) (the list owns the
// entry afterwards) and GetName(index) (null past the end); OE_LIST_ACCESSORS adds GetNumName().
#define OE_LIST_ITEMS(Name, Type, tag, list)                                                                 \
    unsigned short Append##Name(Type* v) {                                                                   \
        return this->AppendToList(tag, v);                                                                   \
    }                                                                                                        \
    Type* Get##Name(unsigned short index) const {                                                            \
        return static_cast<Type*>(list.Get(index));                                                          \
    }
#define OE_LIST_ACCESSORS(Name, Type, tag, list)                                                             \
    OE_LIST_ITEMS(Name, Type, tag, list)                                                                     \
    unsigned short GetNum##Name() const {                                                                    \
        return list.Entries();                                                                               \
    }
// The entries of an OEMixedList seen as Type: AppendName (0 for null or a kind without a row; the
// caller keeps it), GetName(index), GetNumName() and DeleteAllName().
#define OE_ENTRY_ACCESSORS(Name, Type)                                                                       \
    unsigned short Append##Name(Type* v) {                                                                   \
        return this->AppendEntry(v);                                                                         \
    }                                                                                                        \
    Type* Get##Name(unsigned short index) const {                                                            \
        return static_cast<Type*>(this->m_entries.Get(index));                                               \
    }                                                                                                        \
    unsigned short GetNum##Name() const {                                                                    \
        return this->m_entries.Entries();                                                                    \
    }                                                                                                        \
    void DeleteAll##Name() {                                                                                 \
        this->DeleteAllEntries();                                                                            \
    }
// A repeated element kept in the OEDynamicArrayString `list`: AppendName(text), GetName(index),
// GetNumName() and DeleteAllName().
#define OE_TEXTLIST_ACCESSORS(Name, tag, list)                                                               \
    unsigned short Append##Name(const OEString& v) {                                                         \
        return this->AppendText(tag, v);                                                                     \
    }                                                                                                        \
    const OEString* Get##Name(unsigned short i) const {                                                      \
        return list.GetString(i);                                                                            \
    }                                                                                                        \
    unsigned short GetNum##Name() const {                                                                    \
        return list.Entries();                                                                               \
    }                                                                                                        \
    void DeleteAll##Name() {                                                                                 \
        list.DeleteAll();                                                                                    \
    }

// A class that adds nothing to its base (`...`, which may be a template with commas) but its own
// tables: it declares the constructor and Describe, which OE_AGGREGATE_DEFINE defines. An
// invocation ends with a semicolon.
#define OE_AGGREGATE_CLASS(C, ...)                                                                           \
    class OE_API C : public __VA_ARGS__ {                                                                    \
    public:                                                                                                  \
        explicit C(unsigned short version = 0);                                                              \
        const OEAggregateDesc& Describe() const override;                                                    \
    }

// OE_AGGREGATE_DEFINE with the descriptor made in place from the class's static tables, for the
// classes whose descriptor is a plain OE_DESC: one line a class in its source file.
#define OE_AGGREGATE_DEFINE_TABLES(C, Base, tag, valid, required, fields)                                    \
    static const OEAggregateDesc k##C##Desc = OE_DESC(tag, valid, required, fields);                         \
    OE_AGGREGATE_DEFINE(C, Base, k##C##Desc, tag)

#endif
