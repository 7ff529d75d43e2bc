// OEUtility: the entity ("macro") tables shared by the tokenizer and the builder, and the
// required-tag check over a whole tree.
//
// Two tables: the plain one (nbsp, gt, lt, amp) and the XML-quote one, which adds quot and apos.
// Which one is in force is a single process-wide switch, rewritten by every parse and build.
#ifndef OESDK_PARSE_OEUTILITY_H
#define OESDK_PARSE_OEUTILITY_H

#include "oeexport.h"
#include "tags/oetagid.h"

class OEDataObj;
class OEString;

class OE_API OEUtility {
public:
    // 1 selects the XML-quote table, 0 the plain one.
    static void SetXmlQuoteMacros(unsigned short on);
    static unsigned short GetXmlQuoteMacros();

    // 1 when the text holds a character that is written as an entity: "><&", plus the double
    // quote and the apostrophe with the XML-quote table. (A space never is, although "nbsp"
    // decodes to one.)
    static unsigned short ContainsMacro(const char* text);
    // The entity name of a character that is written as one ("gt" for '>'), or null.
    static const char* GetMacroString(char c);
    // The character of an entity name (compared ignoring case, over all rows of the table in
    // force, "nbsp" included), or 0 when the name is not an entity.
    static char GetMacroChar(const char* name, unsigned short length);
    // Replaces every "&name;" whose name is an entity by its character, in place; an "&" that is
    // not the start of an entity is kept as it stands. Returns the new length.
    static unsigned long DecodeMacros(char* text, unsigned long length);

    // Overwrites every character of the text with '*' (its length stays).
    static void MaskText(OEString& text);

    // Walks the tree (the root, then each child in order, depth first) and returns 1 when every
    // object has its required tags. Otherwise 0, with the first incomplete object and its first
    // missing tag in the optional out-parameters.
    static unsigned short AllRequiredPresent(OEDataObj* root, OEDataObj** missingObject = nullptr,
                                             OETagID* missingTag = nullptr);
};

#endif
