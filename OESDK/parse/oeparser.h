// The parser driver. OEParser keeps the stack of open aggregates and the valid-tag filter of the
// innermost one; OESimpleParser drives a tokenizer (OEParseEngine) over one OFX document and
// turns its tokens into calls on a tree of data objects, logging every irregularity in the
// calling thread's OEParseLogger instead of stopping at the first.
//
// A parser, the tree it fills and the log belong to one thread.
#ifndef OESDK_PARSE_OEPARSER_H
#define OESDK_PARSE_OEPARSER_H

#include "oeexport.h"
#include "foundation/oeparsewarning.h"
#include "foundation/oestatus.h"
#include "foundation/oestring.h"
#include "tags/oedataobj.h"

class OEBuffer;
class OEParseEngine;
class OEParseException;
class OEParseLogger;

class OE_API OEParser {
public:
    // At most this many aggregates can be open below the root.
    enum : short { kMaxDepth = 10 };

    // Idle: no current object, depth 0, no filter. Also enables and clears the thread's log.
    OEParser();
    OEParser(const OEParser&) = delete;
    OEParser& operator=(const OEParser&) = delete;
    virtual ~OEParser();

    // Base: makes the root current, applies the quote mode (1 = XML quote entities too) and
    // calls the root's SetupForParsing; returns 0. OESimpleParser parses the whole document.
    virtual OEParseStatus Parse(OEBuffer* buffer, OEDataObj* root, unsigned short checkRequired,
                                unsigned short xmlQuotes);

    // Makes obj the current object (1), or refuses when 10 aggregates are already open (0).
    unsigned short PushObject(OEDataObj* obj);
    // Returns to the enclosing object (1), or 0 when only the root is open.
    unsigned short PopObject();
    // The filter: 1 when the current aggregate accepts the tag for its version.
    unsigned short IsValidTag(OETagID tag) const;
    void SetValidTags(const OEArrayOfTags& tags) { m_validTags = tags; }

    OEDataObj* GetCurrentObject() const { return m_current; }
    short GetDepth() const { return m_depth; }

    // Logging goes to the calling thread's logger.
    unsigned short AppendParseException(OEParseWarning code, const OEString& text, const OEString& auxText,
                                        OETagID tag, OEDataObj* object);
    unsigned short AppendParseException(OEParseException* exception);
    unsigned short GetNumberParseExceptions() const;
    OEParseException* GetParseException(unsigned short index) const;
    unsigned short GetAnyParseExceptionsLogged() const;
    unsigned short CopyExceptionListTo(OEParseLogger* other) const;
    void EnableLogging(unsigned short enabled);

protected:
    struct Frame {
        OEDataObj* m_object;
        OEArrayOfTags m_validTags;
    };

    OEDataObj* m_current;
    Frame m_stack[kMaxDepth];
    short m_depth;
    OEArrayOfTags m_validTags;

private:
    friend class OESimpleParser;
    enum : unsigned { kHintSlots = 512 };

    // IsValidTag as the token loop inlines it; the search of the table is out of line.
    inline unsigned short CheckTag(OETagID tag) const;
    unsigned short SearchTag(OETagID tag) const;

    // Per tag (its low bits), the row of a table where the tag was last found valid. Only a place
    // to look first: a row it names is read and checked like any other, so whatever it holds the
    // filter answers as the full search of the table does.
    mutable unsigned short m_rowHint[kHintSlots];
};

class OE_API OESimpleParser : public OEParser {
public:
    OESimpleParser();
    ~OESimpleParser() override;

    // Parses a whole document (header lines, body) into `root`.
    //   0  parsed cleanly
    //   3  out of memory, or the thread's error code was set during the parse
    //   4  stopped on an error (tokenizer error, rejected start, end of input with open aggregates)
    //   5, 6 ... a data object's own status that stopped the parse
    //   7  parsed to the end, but at least one exception was logged (even with logging disabled)
    // With checkRequired set, the tree's required tags are checked afterwards (OEPW_MISSINGTAG).
    // The value of a USERPASS element is overwritten with '*' as soon as it has been handed on.
    OEParseStatus Parse(OEBuffer* buffer, OEDataObj* root, unsigned short checkRequired,
                        unsigned short xmlQuotes) override;

    // Installs a tokenizer to use instead of one made per parse (not owned; null: make one).
    void SetParseEngine(OEParseEngine* engine) { m_engine = engine; }
    // The object that was current when the parse stopped or first logged, or null.
    OEDataObj* GetObjectWithError() const { return m_objectWithError; }

private:
    OEParseStatus RunTokenLoop(OEParseEngine& engine);

    OEParseEngine* m_engine;
    OEDataObj* m_objectWithError;
};

#endif
