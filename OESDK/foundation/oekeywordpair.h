// Internal to the conversion sources: one enumeration's pair of keyword conversions,
// Stem##ToString and StringTo##Stem, over its table. The last value is the table's last index.
#ifndef OESDK_FOUNDATION_OEKEYWORDPAIR_H
#define OESDK_FOUNDATION_OEKEYWORDPAIR_H

#define OE_KEYWORD_PAIR(Cls, Stem, Type, First, Table)                                                       \
    unsigned short Cls::Stem##ToString(Type value, OEString& out) {                                          \
        return KeywordToString(value, out, First,                                                            \
                               static_cast<unsigned short>(sizeof(Table) / sizeof(Table[0]) - 1), Table);    \
    }                                                                                                        \
    unsigned short Cls::StringTo##Stem(const char* text, Type& value) {                                      \
        return KeywordToEnum(text, value, First,                                                             \
                             static_cast<unsigned short>(sizeof(Table) / sizeof(Table[0]) - 1), Table);      \
    }

// The same table as an OEKeywordTable, for the aggregates' enumeration elements.
#define OE_KEYWORD_TABLE(Name, Table)                                                                        \
    const OEKeywordTable Name = {Table, static_cast<unsigned short>(sizeof(Table) / sizeof(Table[0]))};

#endif
