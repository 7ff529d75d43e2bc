// Result numbers shared by the parse and build protocols.
#ifndef OESDK_FOUNDATION_OESTATUS_H
#define OESDK_FOUNDATION_OESTATUS_H

// Result of every parse operation.
enum OEParseStatus {
    OEPS_OK = 0,
    OEPS_NORESOURCE = 3, // missing parser, factory or object, or out of memory
    OEPS_INVALID = 4,    // tag not valid here, or parsing failed
    OEPS_BADENDTAG = 5,  // end tag does not close the open aggregate
    OEPS_TOODEEP = 6,    // nesting deeper than 10 refused
    OEPS_WARNINGS = 7    // finished, with warnings logged
};

// Result of every build operation.
enum OEBuildStatus {
    OEBS_OK = 0,             // written
    OEBS_OUTOFMEMORY = 1,    // out of memory (or the thread never attached)
    OEBS_NOTEXTFORM = 2,     // the value has no text form
    OEBS_BADARGUMENT = 3,    // bad argument
    OEBS_BLANKVALUE = 4,     // blank value
    OEBS_STRINGTOOLONG = 5,  // string longer than its bound (strict mode)
    OEBS_ILLEGALUSE = 6,     // illegal use
    OEBS_DUPLICATECHILD = 7, // duplicate child
    OEBS_INVALIDSTRING = 8,  // invalid string
    OEBS_MISSINGREQUIRED = 9 // required element missing
};

#endif
