// pvxgen: expands the family tables (*.api) into the public header, the
// per-family export stubs, the entry table and the linker export list.
//
//   pvxgen SOURCE_ROOT [OUTPUT_ROOT]
//
// Reads every *.api file under the family directories of SOURCE_ROOT (sorted
// by path) and writes, under OUTPUT_ROOT (default SOURCE_ROOT):
//   include/pvxi.h             every prototype in full, grouped by family
//   <dir>/<family>.exports.inc the bodies and exported stubs of one table
//   core/entry_index.h         one index per exported name
//   core/entry_table.inc       the table of body addresses
//   core/pvxi.map              the linker version script
//   tests/gen/manifest.inc     one line per exported name, for the tests
//
// Table syntax, one statement per line ('#' starts a comment):
//   group TITLE                     starts a group in the header
//   doc TEXT                        a comment line for the header
//   sig NAME | RETURN | PARAMS      a signature; PARAMS may use placeholders
//   fn PATTERN | TYPES | LAYOUTS | SIG | BODY
//       expands PATTERN for every type x layout; BODY is the callee that the
//       body forwards all arguments to ('-' in TYPES or LAYOUTS: none).
// Placeholders: {t} type code, {T} its C type ({T1}, {T2} source and
// destination of a two-type code such as 32f8u), {E} element type of a
// complex type, {l} layout code, {K} number of constant values of the
// layout (3 for C3 and AC4, 4 for C4), {n} channels in memory.
#include <algorithm>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <map>
#include <sstream>
#include <string>
#include <vector>

namespace fs = std::filesystem;

namespace {

struct Fn {
    std::string name, ret, params, args, sig, body, type, layout, group;
};

struct Table {
    std::string path;   // relative, e.g. pointops/add.api
    std::vector<std::string> headerLines;  // group and doc lines, in order, tagged
    std::vector<Fn> fns;
    std::vector<std::pair<size_t, std::string>> notes;  // (fn index before which, header text)
};

[[noreturn]] void Fail(const std::string& where, const std::string& what)
{
    std::cerr << "pvxgen: " << where << ": " << what << "\n";
    std::exit(1);
}

std::string Trim(const std::string& s)
{
    size_t a = s.find_first_not_of(" \t\r");
    if (a == std::string::npos) return "";
    size_t b = s.find_last_not_of(" \t\r");
    return s.substr(a, b - a + 1);
}

std::vector<std::string> Split(const std::string& s, char sep)
{
    std::vector<std::string> out;
    std::string cur;
    for (char c : s) {
        if (c == sep) { out.push_back(Trim(cur)); cur.clear(); }
        else cur += c;
    }
    out.push_back(Trim(cur));
    return out;
}

std::vector<std::string> Words(const std::string& s)
{
    std::istringstream in(s);
    std::vector<std::string> out;
    for (std::string w; in >> w;) out.push_back(w);
    return out;
}

const std::map<std::string, std::string>& TypeNames()
{
    static const std::map<std::string, std::string> m = {
        {"8u", "Pvx8u"},   {"8s", "Pvx8s"},     {"16u", "Pvx16u"},   {"16s", "Pvx16s"},
        {"32u", "Pvx32u"}, {"32s", "Pvx32s"},   {"32f", "Pvx32f"},   {"64f", "Pvx64f"},
        {"64s", "Pvx64s"}, {"16sc", "Pvx16sc"}, {"32sc", "Pvx32sc"}, {"32fc", "Pvx32fc"},
        {"64fc", "Pvx64fc"}};
    return m;
}

std::string ElementOf(const std::string& code)
{
    if (code.size() > 1 && code.back() == 'c') return TypeNames().at(code.substr(0, code.size() - 1));
    return TypeNames().at(code);
}

// "8u" -> (8u, 8u); "32f8u" -> (32f, 8u)
bool SplitTypes(const std::string& code, std::string& a, std::string& b)
{
    const auto& m = TypeNames();
    if (m.count(code)) { a = b = code; return true; }
    for (size_t i = 1; i < code.size(); ++i) {
        if (m.count(code.substr(0, i)) && m.count(code.substr(i))) {
            a = code.substr(0, i);
            b = code.substr(i);
            return true;
        }
    }
    return false;
}

std::string Replace(std::string s, const std::string& from, const std::string& to)
{
    for (size_t p = s.find(from); p != std::string::npos; p = s.find(from, p + to.size()))
        s.replace(p, from.size(), to);
    return s;
}

int ConstCount(const std::string& layout)
{
    if (layout.rfind("C1", 0) == 0) return 1;
    if (layout.rfind("C2", 0) == 0) return 2;
    if (layout.rfind("C3", 0) == 0 || layout.rfind("AC4", 0) == 0 || layout.rfind("P3", 0) == 0) return 3;
    if (layout.rfind("C4", 0) == 0 || layout.rfind("P4", 0) == 0) return 4;
    return 1;
}

int ChannelsInMemory(const std::string& layout)
{
    if (layout.rfind("AC4", 0) == 0) return 4;
    return ConstCount(layout);
}

// Parameter names, in order, from a C parameter list.
std::string ArgNames(const std::string& params, const std::string& where)
{
    if (params == "void" || params.empty()) return "";
    std::string out;
    for (std::string p : Split(params, ',')) {
        size_t br = p.find('[');
        if (br != std::string::npos) p = Trim(p.substr(0, br));
        size_t e = p.size();
        size_t b = e;
        while (b > 0 && (std::isalnum(static_cast<unsigned char>(p[b - 1])) || p[b - 1] == '_')) --b;
        if (b == e || b == 0) Fail(where, "cannot find a parameter name in '" + p + "'");
        if (!out.empty()) out += ", ";
        out += p.substr(b, e - b);
    }
    return out;
}

Table ReadTable(const fs::path& root, const fs::path& file)
{
    Table t;
    t.path = fs::relative(file, root).generic_string();
    std::ifstream in(file);
    std::map<std::string, std::pair<std::string, std::string>> sigs;
    std::string group;
    std::string line;
    int lineNo = 0;
    while (std::getline(in, line)) {
        ++lineNo;
        std::string where = t.path + ":" + std::to_string(lineNo);
        size_t hash = line.find('#');
        if (hash != std::string::npos) line = line.substr(0, hash);
        line = Trim(line);
        if (line.empty()) continue;
        std::string kw = line.substr(0, line.find_first_of(" \t"));
        std::string rest = Trim(line.substr(kw.size()));
        if (kw == "group") {
            group = rest;
            t.notes.push_back({t.fns.size(), "\n/* ---- " + rest + " ---- */"});
        } else if (kw == "doc") {
            t.notes.push_back({t.fns.size(), "/* " + rest + " */"});
        } else if (kw == "sig") {
            auto f = Split(rest, '|');
            if (f.size() != 3) Fail(where, "sig needs NAME | RETURN | PARAMS");
            sigs[f[0]] = {f[1], f[2]};
        } else if (kw == "fn") {
            auto f = Split(rest, '|');
            if (f.size() != 5) Fail(where, "fn needs PATTERN | TYPES | LAYOUTS | SIG | BODY");
            auto sig = sigs.find(f[3]);
            if (sig == sigs.end()) Fail(where, "unknown signature " + f[3]);
            auto types = Words(f[1]);
            auto layouts = Words(f[2]);
            for (const auto& type : types) {
                for (const auto& layout : layouts) {
                    auto expand = [&](std::string s) {
                        if (type != "-") {
                            std::string a, b;
                            if (!SplitTypes(type, a, b)) Fail(where, "unknown type code " + type);
                            s = Replace(s, "{t}", type);
                            s = Replace(s, "{T1}", TypeNames().at(a));
                            s = Replace(s, "{T2}", TypeNames().at(b));
                            s = Replace(s, "{T}", TypeNames().at(a));
                            s = Replace(s, "{E}", ElementOf(a));
                        }
                        if (layout != "-") {
                            s = Replace(s, "{l}", layout);
                            s = Replace(s, "{K}", std::to_string(ConstCount(layout)));
                            s = Replace(s, "{n}", std::to_string(ChannelsInMemory(layout)));
                        }
                        if (s.find('{') != std::string::npos) Fail(where, "unexpanded placeholder in '" + s + "'");
                        return s;
                    };
                    Fn fn;
                    fn.name = expand(f[0]);
                    fn.ret = expand(sig->second.first);
                    fn.params = expand(sig->second.second);
                    fn.args = ArgNames(fn.params, where);
                    fn.sig = f[3];
                    fn.body = expand(f[4]);
                    fn.type = type;
                    fn.layout = layout;
                    fn.group = group;
                    t.fns.push_back(fn);
                }
            }
        } else {
            Fail(where, "unknown statement " + kw);
        }
    }
    return t;
}

// Writes only when the content changed, so that a regeneration that changes
// nothing does not force a rebuild.
void Write(const fs::path& path, const std::string& text)
{
    {
        std::ifstream in(path, std::ios::binary);
        if (in) {
            std::stringstream old;
            old << in.rdbuf();
            if (old.str() == text) return;
        }
    }
    fs::create_directories(path.parent_path());
    std::ofstream out(path, std::ios::binary);
    out << text;
    if (!out) Fail(path.string(), "cannot write");
}

std::string Proto(const Fn& f)
{
    return f.ret + " " + f.name + "(" + f.params + ")";
}

}  // namespace

int main(int argc, char** argv)
{
    if (argc < 2 || argc > 3) {
        std::cerr << "usage: pvxgen SOURCE_ROOT [OUTPUT_ROOT]\n";
        return 2;
    }
    fs::path root = argv[1];
    fs::path out = argc == 3 ? fs::path(argv[2]) : root;
    const char* dirs[] = {"core", "pointops", "stats", "filters", "geometry", "transforms"};
    std::vector<fs::path> files;
    for (const char* d : dirs) {
        if (!fs::is_directory(root / d)) continue;
        for (const auto& e : fs::directory_iterator(root / d))
            if (e.path().extension() == ".api") files.push_back(e.path());
    }
    std::sort(files.begin(), files.end());
    std::vector<Table> tables;
    std::map<std::string, std::string> seen;
    for (const auto& f : files) {
        tables.push_back(ReadTable(root, f));
        for (const auto& fn : tables.back().fns) {
            auto [it, fresh] = seen.emplace(fn.name, tables.back().path);
            if (!fresh) Fail(tables.back().path, fn.name + " is also in " + it->second);
        }
    }

    // include/pvxi.h
    std::string h;
    h += "/* generated from the family tables (*.api) by tools/pvxgen; do not edit */\n";
    h += "/* pvxi.h: every exported image function of pvx. */\n";
    h += "#ifndef PVXI_H\n#define PVXI_H\n\n#include \"pvxtypes.h\"\n#include \"pvxcore.h\"\n\n";
    h += "#ifdef __cplusplus\nextern \"C\" {\n#endif\n";
    for (const auto& t : tables) {
        h += "\n/* ==== " + t.path + " ==== */\n";
        size_t note = 0;
        for (size_t i = 0; i <= t.fns.size(); ++i) {
            while (note < t.notes.size() && t.notes[note].first == i) h += t.notes[note++].second + "\n";
            if (i < t.fns.size()) h += "PVX_API " + Proto(t.fns[i]) + ";\n";
        }
    }
    h += "\n#ifdef __cplusplus\n}\n#endif\n\n#endif /* PVXI_H */\n";
    Write(out / "include/pvxi.h", h);

    // core/entry_index.h and core/entry_table.inc
    std::string idx = "// generated from the family tables (*.api) by tools/pvxgen; do not edit\n";
    idx += "#pragma once\n\nnamespace pvx {\n\nenum EntryIndex : int {\n";
    std::string tab = "// generated from the family tables (*.api) by tools/pvxgen; do not edit\n";
    tab += "// Body declarations and the table of body addresses, in entry order.\n\n";
    tab += "namespace pvx::body {\n";
    std::string init;
    std::string map = "/* generated from the family tables (*.api) by tools/pvxgen; do not edit */\n";
    map += "{\n  global:\n";
    std::string man = "// generated from the family tables (*.api) by tools/pvxgen; do not edit\n";
    man += "// PVX_MANIFEST(name, table, group, type, layout, signature, return type, pointer parameters)\n";
    for (const auto& t : tables) {
        for (const auto& f : t.fns) {
            idx += "    kEntry_" + f.name + ",\n";
            tab += f.ret + " " + f.name + "(" + f.params + ");\n";
            init += "    reinterpret_cast<EntryFn>(&body::" + f.name + "),\n";
            map += "    " + f.name + ";\n";
            int pointers = 0;
            for (const auto& p : Split(f.params, ','))
                if (p.find('*') != std::string::npos || p.find('[') != std::string::npos) ++pointers;
            man += "PVX_MANIFEST(" + f.name + ", \"" + t.path + "\", \"" + f.group + "\", \"" + f.type + "\", \"" +
                   f.layout + "\", " + f.sig + ", " + f.ret + ", " + std::to_string(pointers) + ")\n";
        }
    }
    idx += "    kEntryCount\n};\n\n}  // namespace pvx\n";
    tab += "}  // namespace pvx::body\n\nnamespace pvx {\n\nextern const EntryFn kEntries[kEntryCount] = {\n" + init +
           "};\n\n}  // namespace pvx\n";
    map += "  local:\n    *;\n};\n";
    Write(out / "core/entry_index.h", idx);
    Write(out / "core/entry_table.inc", tab);
    Write(out / "core/pvxi.map", map);
    Write(out / "tests/gen/manifest.inc", man);

    // <dir>/<family>.exports.inc
    for (const auto& t : tables) {
        std::string s = "// generated from " + t.path + " by tools/pvxgen; do not edit\n";
        s += "// The bodies, then the exported stubs that reach them through the entry table.\n\n";
        s += "namespace pvx::body {\n";
        for (const auto& f : t.fns)
            s += Proto(f) + "\n{ return " + f.body + "(" + f.args + "); }\n";
        s += "}  // namespace pvx::body\n\n";
        for (const auto& f : t.fns) {
            s += "extern \"C\" PVX_API " + Proto(f) + "\n{ return pvx::Entry<decltype(&pvx::body::" + f.name +
                 ")>(pvx::kEntry_" + f.name + ")(" + f.args + "); }\n";
        }
        fs::path rel = fs::path(t.path).replace_extension(".exports.inc");
        Write(out / rel, s);
    }
    return 0;
}
