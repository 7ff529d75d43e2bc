// OEParseEngine: the tokenizer. It scans one OFX document held in an OEBuffer and hands the
// driver the header lines, then one token at a time: aggregate start tags, elements with their
// values, end tags, the end of input. SGML (elements without end tags) and the XML-like form
// (with them) need no switch: a start tag followed by text is an element, one followed by a tag
// opens an aggregate.
//
// The scanner works on the buffer's block with memchr-style searches; a token costs a few
// searches, one dictionary probe and one copy of its value.
#ifndef OESDK_PARSE_OEPARSEENGINE_H
#define OESDK_PARSE_OEPARSEENGINE_H

#include "oeexport.h"
#include "foundation/oestring.h"
#include "tags/oeheadertag.h"
#include "tags/oetagdictionary.h"

#include <cstdint>

class OEBuffer;

// The scanner's private steps stay out of the export table (and out of the PLT on ELF).
#if defined(_WIN32)
#define OE_INTERNAL
#else
#define OE_INTERNAL __attribute__((visibility("hidden")))
#endif

enum OETokenKind {
    OETK_ERROR = -1,    // malformed tag, or text where a tag was expected
    OETK_AGGSTART = 0,  // a start tag that opens an aggregate
    OETK_ENDTAG = 1,    // an end tag
    OETK_ELEMENT = 2,   // a start tag together with its value
    OETK_ENDOFINPUT = 3 // nothing left
};

class OE_API OEParseEngine {
public:
    // Remembers the buffer (not owned; it must outlive the engine and not change meanwhile).
    explicit OEParseEngine(OEBuffer* buffer);
    OEParseEngine(const OEParseEngine&) = delete;
    OEParseEngine& operator=(const OEParseEngine&) = delete;
    virtual ~OEParseEngine();

    // Reads the next header line in front of the body: 1 with its tag (OEHT_UNKNOWN when the
    // name is none of the header names; the name is still given), name and value, both trimmed;
    // 0 when the header block is over (at the first "<" that starts the body, or at the end).
    // The name=value pairs of an "<?OFX ...?>" declaration are read as header lines too; other
    // "<!...>" and "<?...?>" constructs in front of the body are skipped.
    unsigned short GetNextHeader(OEHeaderTag& tag, OEString& name, OEString& value);

    // The next token (OETokenKind). For a tag, `entry` is its dictionary row; for an element,
    // GetValue() holds the decoded value (CDATA as it stands); for OETK_ERROR, the raw text.
    // Unknown tags never come out: they are logged (OEPW_UNKNOWNTAG) and an unknown aggregate is
    // skipped up to its end tag. A tag found only ignoring case is logged OEPW_LOWERCASE.
    int GetNextToken(const OETagDictionaryEntry*& entry);
    // The value of the last element (or the text of the last error). The driver may overwrite it.
    OEString& GetValue() { return m_value; }

    // Skips the aggregate whose start tag was just returned, up to and including the first end
    // tag whose name equals `name` ignoring case. Returns 1; when there is no such end tag the
    // position is left where it was, OEPW_SKIPFAILED is logged and 0 returned.
    unsigned short SkipAggregate(const char* name);

    // 1 when the aggregate start tag just returned is directly followed by its own end tag
    // ("<MEMO></MEMO>"): the driver treats it as an empty element when no aggregate takes it.
    unsigned short LastStartWasEmpty() const { return m_lastStartEmpty ? 1 : 0; }

    // With `skip` set, an element's own end tag written right after its value ("<NAME>x</NAME>",
    // the XML-like form) is consumed with the element instead of coming out as a token of its
    // own, and LastElementClosed() says so. Off by default; the parser turns it on, since it would
    // only pass over that end tag.
    void SetSkipElementEndTags(bool skip) { m_skipElementEnd = skip; }
    bool GetSkipElementEndTags() const { return m_skipElementEnd; }
    // The common tokens ("<NAME>value", "</NAME>", an aggregate's start tag) are read in one
    // pass over the bytes; everything else goes through the general scanner, which gives the same
    // tokens, values and log entries. Off sends every token the general way (for checking the two
    // against each other, or for narrowing down a tokenizer problem). On by default.
    void SetFastScan(bool on) { m_fastScan = on; }
    // 1 when the element just returned had its end tag consumed with it.
    unsigned short LastElementClosed() const { return m_elementClosed ? 1 : 0; }

    // Steps over a "--boundary" line of a multipart file, if the body starts with one. Returns 1,
    // or 0 when such a line has no end.
    unsigned short SkipBoundaryLine();

    // The input offset scanning goes on from. (The buffer's offset, for the log, is the start of the
    // token last returned.)
    unsigned long GetOffset() const { return m_pos; }

    // Resolves a tag name: exact first, then ignoring case (logging OEPW_LOWERCASE with the name
    // when the name holds a lower-case letter). Null when unknown (nothing logged).
    static const OETagDictionaryEntry* ResolveTagName(const char* name, unsigned short length);

private:
    enum RawKind { kRawEnd, kRawText, kRawCData, kRawStart, kRawEndTag, kRawBad, kRawEmpty };
    struct RawToken {
        int m_kind;
        unsigned long m_start; // text, CDATA content, or tag name
        unsigned long m_length;
        unsigned long m_tagStart; // the "<" of a tag
        unsigned long m_next;     // where scanning goes on after this token
        signed char m_hasAmp;     // text: 1 holds "&", 0 does not, -1 not looked at
        bool m_hasNul;            // text: holds a 0 byte
    };
    // The value string, filled in one copy.
    class ValueText : public OEString {
    public:
        // Copies n bytes that hold no 0 byte (16 may be read when canOverRead). Returns 1, or 0
        // when memory is short.
        unsigned short SetRaw(const char* text, unsigned long n, bool canOverRead);
    };

    // The common tokens in one pass: "<NAME>value", "</NAME>", and "<NAME>" followed by another
    // start tag. Returns the token kind, or kNotFast (nothing changed) for anything else.
    enum { kNotFast = -2 };
    OE_INTERNAL int FastToken(const OETagDictionaryEntry*& entry);
    OE_INTERNAL int GeneralToken(const OETagDictionaryEntry*& entry);
    OE_INTERNAL void ScanRaw(RawToken& token);
    OE_INTERNAL void ScanFast(RawToken& token);
    OE_INTERNAL bool ScanShortTag(unsigned long p, RawToken& token) const;
    OE_INTERNAL const OETagDictionaryEntry* Resolve(const RawToken& token);
    OE_INTERNAL void ScanTag(unsigned long lt, RawToken& token);
    OE_INTERNAL unsigned short ReadText(const RawToken& token);
    OE_INTERNAL unsigned short NextPiHeader(OEHeaderTag& tag, OEString& name, OEString& value);
    OE_INTERNAL void LogAt(unsigned long pos, int code, const char* text, unsigned long length,
                           OETagID tag = OETAG_NONE);
    OE_INTERNAL void SyncOffset(unsigned long pos);
    OE_INTERNAL void TakeElementEnd(unsigned long at, unsigned short nameLength);

    OETagDictionary* m_dictionary;
    OEBuffer* m_buffer;
    const char* m_data;
    unsigned long m_size;
    unsigned long m_tokenStart; // where the token last returned starts
    RawToken m_lookAhead;
    bool m_haveLookAhead;
    unsigned long m_pos;
    unsigned long m_headerPos;
    unsigned long m_piPos; // inside an "<?OFX" declaration while non-zero
    unsigned long m_piEnd;
    bool m_headersDone;
    bool m_lastStartEmpty;
    bool m_skipElementEnd = false;
    bool m_elementClosed = false;
    bool m_fastScan = true;
    ValueText m_value;
    // The name of the last unknown element, whose end tag is dropped with it.
    OEString m_unknownElement;
    // The last element's name as written and its row: its XML-style end tag resolves to the
    // same row without a second lookup (and without logging a lower-case name twice).
    unsigned long m_elementNameStart;
    unsigned short m_elementNameLength;
    const OETagDictionaryEntry* m_elementEntry;
};

#undef OE_INTERNAL

#endif
