#!/usr/bin/env python3
"""Export discipline of the built library.

  check-exports.py so  BUILD/liboesdk.so   every exported symbol comes from an OE_API declaration
  check-exports.py dll BUILD/oesdk.dll     the same for the DLL's export table, and the DLL imports
                                           only Windows system DLLs (no MinGW runtime DLLs)

A symbol counts as OE_API when one of its enclosing classes is declared `class OE_API X` /
`struct OE_API X`, or its own name appears in an `OE_API ...name(` / `OE_API ... name;` declaration
of a public header under OESDK/, or it belongs to an instantiation of a class template that a public
header defines (MinGW exports the typeinfo of such a base of an OE_API class). On Linux, weak
instantiations of standard-library templates are exported as well (libstdc++ gives namespace std
default visibility); they are counted, not flagged.
"""
import os
import re
import subprocess
import sys

SOURCE_DIR = os.path.join(os.path.dirname(os.path.abspath(__file__)), "..", "OESDK")

STD_NAMESPACES = ("std", "__gnu_cxx", "__cxxabiv1")
# Linker-defined markers, not symbols of the code.
LINKER_SYMBOLS = {"_init", "_fini", "_edata", "_end", "__bss_start"}
SYMBOL_PREFIXES = ("typeinfo name for ", "typeinfo for ", "vtable for ", "VTT for ",
                   "construction vtable for ", "guard variable for ", "non-virtual thunk to ",
                   "virtual thunk to ", "covariant return thunk to ", "reference temporary #0 for ")
# Windows DLLs that every Windows installation has; anything else would have to ship with us.
SYSTEM_DLL = re.compile(
    r"^(api-ms-win-[a-z0-9-]+|kernel32|user32|gdi32|advapi32|msvcrt|ws2_32|winhttp|crypt32|secur32|"
    r"bcrypt|ncrypt|shell32|ole32|oleaut32|shlwapi|rpcrt4|iphlpapi|dnsapi|wininet|winmm|version|"
    r"userenv|ntdll|normaliz|wldap32|ucrtbase)\.dll$", re.IGNORECASE)


TOKEN = re.compile(r"\bnamespace\s+(\w+)\s*\{|\b(?:class|struct)\s+(?:OE_API\s+)?(\w+)[^;{()]*\{|"
                   r"\bOE_API\b|\{|\}")


def public_declarations():
    """Returns (classes, names): classes declared OE_API (plus public class templates) and the
    qualified names ("Util::GetOps", "OEAttachThread") of OE_API functions and variables."""
    classes, names = set(), set()
    headers = []
    for root, dirs, files in os.walk(SOURCE_DIR):
        dirs[:] = [d for d in dirs if d != "internal"]
        for f in files:
            if f.endswith(".h"):
                with open(os.path.join(root, f), encoding="utf-8", errors="replace") as h:
                    headers.append(h.read())
    # A macro that declares an OE_API class from its first parameter (a family of classes with the
    # same shape): each use, in any header, declares that class.
    for text in headers:
        for macro, param, body in re.findall(r"#define\s+(\w+)\(\s*(\w+)[^)]*\)((?:[^\n]*\\\n)*[^\n]*)", text):
            if re.search(r"\b(?:class|struct)\s+OE_API\s+" + param + r"\b", body):
                for other in headers:
                    classes.update(re.findall(r"^\s*" + macro + r"\(\s*(\w+)", other, flags=re.M))
    for text in headers:
        text = re.sub(r"/\*.*?\*/", " ", text, flags=re.S)
        text = re.sub(r"//[^\n]*", " ", text)
        text = re.sub(r"^\s*#[^\n]*", " ", text, flags=re.M)
        classes.update(re.findall(r"\b(?:class|struct)\s+OE_API\s+(\w+)", text))
        classes.update(re.findall(r"\btemplate\s*<[^;{]*?>\s*(?:class|struct)\s+(?:OE_API\s+)?(\w+)\s*[:{]",
                                  text))
        scope = []  # one entry per open brace: a namespace or class name, or None
        for m in TOKEN.finditer(text):
            tok = m.group(0)
            if m.group(1) or m.group(2):
                scope.append(m.group(1) or m.group(2))
            elif tok == "{":
                scope.append(None)
            elif tok == "}":
                if scope:
                    scope.pop()
            elif not re.search(r"\b(?:class|struct)\s+$", text[max(0, m.start() - 16):m.start()]):
                decl = re.split(r"[;{]", text[m.end():], maxsplit=1)[0]
                head = decl.split("(", 1)[0] if "(" in decl else re.split(r"[=\[]", decl)[0]
                ids = ["operator"] if re.search(r"\boperator\b", head) else re.findall(r"~?\w+", head)
                if ids:
                    names.add("::".join([s for s in scope if s] + [ids[-1]]))
    return classes, names


def split_name(symbol):
    """Demangled symbol -> list of its qualified name's components, template arguments removed."""
    s = symbol
    for p in SYMBOL_PREFIXES:
        if s.startswith(p):
            s = s[len(p):]
            break
    s = s.split("-in-", 1)[0]  # "construction vtable for A-in-B"
    s = re.sub(r"\boperator\s*(\(\)|\[\]|new\[\]|delete\[\]|[^\w\s(]+|\s+[^(]+?(?=\())", "operator", s)
    s = re.sub(r"\{lambda\([^)]*\)#\d+\}|\{unnamed type#\d+\}|\(anonymous namespace\)", "anon", s)
    out, depth = [], 0
    for ch in s:
        if ch == "<":
            depth += 1
        elif ch == ">":
            depth = max(0, depth - 1)
        elif depth == 0:
            if ch == "(":
                break
            out.append(ch)
    qualified = "".join(out).strip().split(" ")[-1]
    return [c for c in qualified.split("::") if c]


def classify(symbols, classes, names):
    bad, std = [], 0
    for sym in symbols:
        parts = split_name(sym)
        if not parts or sym in LINKER_SYMBOLS:
            continue
        if parts[0] in STD_NAMESPACES:
            std += 1
            continue
        if any(p in classes for p in parts) or "::".join(parts) in names:
            continue
        bad.append(sym)
    return bad, std


def demangle(raw):
    filt = "x86_64-w64-mingw32-c++filt"
    try:
        out = subprocess.run([filt], input="\n".join(raw), capture_output=True, text=True, check=True)
    except FileNotFoundError:
        out = subprocess.run(["c++filt"], input="\n".join(raw), capture_output=True, text=True, check=True)
    return out.stdout.splitlines()


def check_so(path):
    out = subprocess.run(["nm", "-DC", "--defined-only", path], capture_output=True, text=True, check=True)
    symbols = [line.split(" ", 2)[2] for line in out.stdout.splitlines() if line.count(" ") >= 2]
    classes, names = public_declarations()
    bad, std = classify(symbols, classes, names)
    print(f"exports: {len(symbols)} symbols in {os.path.basename(path)}: {len(symbols) - std - len(bad)} "
          f"from OE_API declarations, {std} weak standard-library instantiations, {len(bad)} other")
    for b in bad:
        print(f"  not OE_API: {b}")
    return not bad


def check_dll(path):
    objdump = "x86_64-w64-mingw32-objdump"
    text = subprocess.run([objdump, "-p", path], capture_output=True, text=True, check=True).stdout
    ok = True
    imports = re.findall(r"^\s*DLL Name:\s*(\S+)", text, flags=re.M)
    foreign = [d for d in imports if not SYSTEM_DLL.match(d)]
    print(f"imports: {os.path.basename(path)} imports {', '.join(imports) or 'nothing'}")
    for d in foreign:
        print(f"  not a Windows system DLL: {d}")
        ok = False
    table = text.split("[Ordinal/Name Pointer] Table", 1)
    raw = []
    if len(table) == 2:
        for line in table[1].splitlines()[1:]:
            m = re.match(r"^\s*\[\s*\d+\]\s+(\S+)", line)
            if not m:
                break
            raw.append(m.group(1))
    symbols = demangle(raw)
    classes, names = public_declarations()
    bad, std = classify(symbols, classes, names)
    # MinGW g++ marks the typeinfo of a libstdc++ base class (std::thread::_State, std::_Sp_counted_base)
    # for export in every object that emits it; only that is tolerated from namespace std.
    std_all = [s for s in symbols if split_name(s)[:1] and split_name(s)[0] in STD_NAMESPACES]
    std_typeinfo = [s for s in std_all if s.startswith(("typeinfo for ", "typeinfo name for "))]
    print(f"exports: {len(symbols)} symbols in {os.path.basename(path)}: {len(symbols) - std - len(bad)} "
          f"from OE_API declarations, {len(std_typeinfo)} standard-library typeinfo emitted by g++, "
          f"{len(bad) + len(std_all) - len(std_typeinfo)} other")
    for b in bad + [s for s in std_all if s not in std_typeinfo]:
        print(f"  not OE_API: {b}")
        ok = False
    if not symbols:
        print("  the DLL exports nothing")
        ok = False
    return ok


def main():
    if len(sys.argv) != 3 or sys.argv[1] not in ("so", "dll"):
        print("\n".join(__doc__.strip().splitlines()[2:5]), file=sys.stderr)
        return 2
    ok = check_so(sys.argv[2]) if sys.argv[1] == "so" else check_dll(sys.argv[2])
    return 0 if ok else 1


if __name__ == "__main__":
    sys.exit(main())
