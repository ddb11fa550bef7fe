#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Makes from sources.json what must say the same: the source classes, their descriptor table and the protocol's tables."""

import argparse
import json
import pathlib
import sys

INT_RANGE = (-2147483648, 2147483647)
REAL_LIMIT = 1e15
TEXT_LIMIT = 4096
LIST_LIMIT = 1000
CPP_TYPES = {"bool": "bool", "int": "int", "real": "double", "text": "QString", "intList": "QList<int>",
             "records": "QVariantList"}
VALUE_TYPES = {"bool": "Bool", "int": "Int", "real": "Real", "text": "Text", "intList": "IntList", "records": "Records"}
DOC_BEGIN = "<!-- tables of sources.json: begin -->"
DOC_END = "<!-- tables of sources.json: end -->"
NOTICE = "// SPDX-License-Identifier: MIT\n// Made from sources.json by generate.py.\n"


class Table:
    """The checked content of sources.json."""

    def __init__(self, path):
        content = json.loads(path.read_text(encoding="utf-8"))
        self.records = {record["name"]: record for record in content["records"]}
        self.sources = content["sources"]
        self.by_name = {source["name"]: source for source in self.sources}
        self.check()

    def check(self):
        for source in self.sources:
            names = [item["name"] for kind in ("state", "calls", "events") for item in self.all_of(source, kind)]
            doubles = {name for name in names if names.count(name) > 1}
            if doubles:
                sys.exit(f"{source['name']}: listed twice: {', '.join(sorted(doubles))}")
            for field in source.get("state", []):
                self.check_type(source, field)
            for item in source.get("calls", []) + source.get("events", []):
                for argument in item.get("args", []):
                    self.check_type(source, argument)

    def check_type(self, source, item):
        if item["type"] not in CPP_TYPES and not self.enum_of(source, item["type"]):
            sys.exit(f"{source['name']}.{item['name']}: unknown type {item['type']}")
        if item["type"] == "records" and item["record"] not in self.records:
            sys.exit(f"{source['name']}.{item['name']}: unknown record {item['record']}")

    def lineage(self, source):
        base = source.get("base")
        return (self.lineage(self.by_name[base]) if base else []) + [source]

    def all_of(self, source, kind):
        return [item for ancestor in self.lineage(source) for item in ancestor.get(kind, [])]

    def enum_of(self, source, name):
        return next((enum for enum in self.all_of(source, "enums") if enum["name"] == name), None)

    def classes(self):
        return [source for source in self.sources if "class" not in source]

    def cpp_type(self, item):
        return CPP_TYPES.get(item["type"], item["type"])

    def qualified_type(self, item):
        """As cpp_type(), with the whole name of an enumeration, which is what the meta-object system compares."""
        kind = self.cpp_type(item)
        owners = (source["name"] for source in self.sources if any(enum["name"] == kind for enum in source.get("enums", [])))
        owner = next(owners, None)
        return f"AL2HMIBridge::{owner}::{kind}" if owner else kind


def literal(text):
    return json.dumps(text, ensure_ascii=False)


def latin1(text):
    return f"QLatin1String({literal(text)}, {len(text)})"


def limits(item):
    kind = item["type"]
    if kind == "int":
        return item.get("min", INT_RANGE[0]), item.get("max", INT_RANGE[1])
    if kind == "real":
        return item.get("min", -REAL_LIMIT), item.get("max", REAL_LIMIT)
    if kind == "text":
        return 0, item.get("max", TEXT_LIMIT)
    if kind in ("intList", "records"):
        return 0, item.get("max", LIST_LIMIT)
    return INT_RANGE


def default_of(item):
    """The C++ expression of a field's default."""
    value = item.get("default")
    kind = item["type"]
    if kind == "bool":
        return "true" if value else "false"
    if kind == "int":
        return str(value or 0)
    if kind == "real":
        return str(float(value or 0))
    if kind == "text":
        return f"QStringLiteral({literal(value)})" if value else "QString()"
    if kind == "intList":
        return "QList<int>{" + ", ".join(map(str, value or [])) + "}"
    if kind == "records":
        return "QVariantList()"
    return value


def lower_first(text):
    return text[0].lower() + text[1:]


def parameter(table, argument):
    kind = table.qualified_type(argument)
    return f"const QString& {argument['name']}" if kind == "QString" else f"{kind} {argument['name']}"


def parameters(table, item):
    return ", ".join(parameter(table, argument) for argument in item.get("args", []))


def unit_note(item):
    low, high = limits(item)
    if item["type"] in ("int", "real") and ("min" in item or "max" in item):
        return f" ({low} to {high})" if "max" in item else f" (at least {low})"
    if item["type"] in ("text", "intList", "records"):
        what = "UTF-16 units" if item["type"] == "text" else "entries"
        return f" (at most {high} {what})"
    return ""


def field_doc(item):
    record = f"; maps shaped like \"{item['record']}\"" if item["type"] == "records" else ""
    return item["brief"][0].upper() + item["brief"][1:] + unit_note(item) + record + "."


def call_doc(item):
    notes = [f"\\a {argument['name']}: {argument['brief']}" for argument in item.get("args", []) if "brief" in argument]
    return item["brief"] + (" " + "; ".join(notes) + "." if notes else "")


def enum_lines(enum):
    yield f"    /// \\brief {enum['brief']}" + (" Numbers without a name may occur." if enum.get("open") else "")
    yield f"    enum {enum['name']} : int {{"
    for value in enum["values"]:
        yield f"        {value['name']} = {value['value']}, ///< {value.get('brief') or value['native'] + ', ' + value['locale']}"
    yield "    };"
    yield f"    Q_ENUM({enum['name']})"
    yield ""


def header(table, source):
    name, base, state = source["name"], source.get("base", "Source"), source.get("state", [])
    events, calls = source.get("events", []), source.get("calls", [])
    abstract = source.get("abstract")
    out = [NOTICE + "#pragma once", "", '#include "al2hmibridge_export.h"', f'#include "{base.lower()}.h"', "",
           "#include <QList>", "#include <QString>", "#include <QVariantList>", "", "namespace AL2HMIBridge {", "",
           f"/// \\brief {source['brief']}", "///",
           "/// State is what the application layer reported last, or the default while nothing was reported; getters answer at",
           "/// once. Calls leave without waiting; while no peer is there they are reported and dropped. GUI thread only.",
           f"class AL2HMIBRIDGE_EXPORT {name} : public {base}", "{", "    Q_OBJECT"]
    for field in state:
        out.append(f"    Q_PROPERTY({table.cpp_type(field)} {field['name']} READ {field['name']} NOTIFY {field['name']}Changed)")
    out += ["", "public:"]
    for enum in source.get("enums", []):
        out += enum_lines(enum)
    if not abstract:
        out += ["    /// \\brief The process's one object, made on the first call as a child of the application object.",
                f"    static {name}* instance();", f"    ~{name}() override;", ""]
    for field in state:
        out += [f"    /// \\brief {field_doc(field)}",
                f"    {table.cpp_type(field)} {field['name']}() const {{ return m_{field['name']}; }}", ""]
    for call in calls:
        out += [f"    /// \\brief {call_doc(call)}", f"    Q_INVOKABLE void {call['name']}({parameters(table, call)});", ""]
    if state or events:
        out.append("Q_SIGNALS:")
        out += [f"    void {field['name']}Changed();" for field in state]
        for event in events:
            out += [f"    /// \\brief {event['brief']}", f"    void {event['name']}({parameters(table, event)});"]
        out.append("")
    if abstract:
        out += ["protected:", f"    explicit {name}(const char* name); ///< as Source", f"    ~{name}() override;",
                "    static const SourceInfo& info(); ///< state and calls that its sources share", "", "private:"]
    else:
        out += ["private:", "    friend struct SourceTable;", f"    {name}();", "    static const SourceInfo& info();", ""]
    for field in state:
        out.append(f"    {table.cpp_type(field)} m_{field['name']} = {default_of(field)};")
    if out[-1] == "":
        out.pop()
    return "\n".join(out + ["};", "", "} // namespace AL2HMIBridge", ""])


def value_shape(table, source, item):
    enum = table.enum_of(source, item["type"])
    low, high = limits(item)
    known = "{}"
    if enum and not enum.get("open"):
        known = f"{{known{enum['name']}, {len(enum['values'])}}}"
    record = f"&record{item['record']}" if item["type"] == "records" else "nullptr"
    return f"{{ValueType::{VALUE_TYPES.get(item['type'], 'Int')}, {float(low)!r}, {float(high)!r}, {known}, {record}}}"


def stored_default(item):
    return f"int({default_of(item)})" if item["type"] not in CPP_TYPES else default_of(item)


def rows(name, count):
    return f"{{{name}, {count}}}" if count else "{}"


def info_body(table, source, owner):
    out = []
    for event in source.get("events", []):
        if event.get("args"):
            out.append(f"    static const Argument {event['name']}Arguments[] = {{")
            out += [f"        {{{latin1(a['name'])}, {value_shape(table, source, a)}}}," for a in event["args"]]
            out.append("    };")
    if source.get("events"):
        out.append("    static const Event events[] = {")
        for event in source["events"]:
            arguments = rows(event["name"] + "Arguments", len(event.get("args", [])))
            out.append(f"        {{{latin1(event['name'])}, {arguments}, &emitEvent<&{owner}::{event['name']}>}},")
        out.append("    };")
    if source.get("state"):
        out.append("    static const Field fields[] = {")
        for field in source["state"]:
            out += [f"        {{{latin1(field['name'])}, {value_shape(table, source, field)},",
                    f"         [] {{ return Value({stored_default(field)}); }},",
                    f"         &store<&{owner}::m_{field['name']}>, &notify<&{owner}::{field['name']}Changed>}},"]
        out.append("    };")
    base = f"&{source['base']}::info()" if "base" in source else "nullptr"
    instance = "nullptr" if source.get("abstract") else f"[]() -> QObject* {{ return {owner}::instance(); }}"
    channel = source.get("channel", "messages").capitalize()
    out += [f"    static const SourceInfo info = {{{latin1(source['name'])}, BridgeEndpoint::{channel}, {base},",
            f"                                    {rows('fields', len(source.get('state', [])))},"
            f" {rows('events', len(source.get('events', [])))}, {instance}}};",
            "    return info;"]
    return out


def encoded(argument, table):
    return argument["name"] if argument["type"] in CPP_TYPES else f"int({argument['name']})"


def class_source(table, source):
    name, base = source["name"], source.get("base", "Source")
    out = []
    if source.get("abstract"):
        out += [f"{name}::{name}(const char* name)", f"    : {base}(name)", "{", "}", ""]
    else:
        out += [f"{name}::{name}()", f"    : {base}({literal(name)})", "{", "}", "",
                f"{name}* {name}::instance()", "{", f"    static QPointer<{name}> source;", "    if (!source)",
                f"        source = new {name};", "    return source;", "}", ""]
    out += [f"{name}::~{name}() = default;", ""]
    for call in source.get("calls", []):
        values = ", ".join(encoded(argument, table) for argument in call.get("args", []))
        arguments = f", QJsonArray{{{values}}}" if values else ""
        out += [f"void {name}::{call['name']}({parameters(table, call)})", "{",
                f"    send({literal(call['name'])}{arguments});", "}", ""]
    return out + [f"const SourceInfo& {name}::info()", "{"] + info_body(table, source, name) + ["}", ""]


def sources_cpp(table):
    out = [NOTICE + '#include "sourceinfo.h"', "", '#include "binding.h"']
    out += [f'#include "{source.get("class", source["name"]).lower()}.h"' for source in table.sources]
    out += ["", "#include <QJsonArray>", "#include <QPointer>", "", "namespace AL2HMIBridge {", "", "namespace {", ""]
    for source in table.sources:
        for enum in source.get("enums", []):
            if not enum.get("open"):
                values = ", ".join(str(value["value"]) for value in enum["values"])
                out.append(f"[[maybe_unused]] constexpr int known{enum['name']}[] = {{{values}}};")
    for record in table.records.values():
        out.append(f"const Argument fields{record['name']}[] = {{")
        out += [f"    {{{latin1(field['name'])}, {value_shape(table, {'name': ''}, field)}}}," for field in record["fields"]]
        out += ["};", f"const Record record{record['name']} = {{{latin1(record['name'])},"
                f" {{fields{record['name']}, {len(record['fields'])}}}}};"]
    languages = table.enum_of(table.by_name["GlobalSource"], "SystemLanguage")["values"]
    out += ["", "const Language languageRows[] = {"]
    out += [f"    {{{v['value']}, {latin1(v['locale'])}, {literal(v['native'])}}}," for v in languages]
    out += ["};", ""]
    handwritten = [source for source in table.sources if "class" in source]
    for source in handwritten:
        out += [f"const SourceInfo& {lower_first(source['name'])}Info()", "{"]
        out += info_body(table, source, source["class"]) + ["}", ""]
    out += ["} // namespace", ""]
    for source in table.classes():
        out += class_source(table, source)
    out += ["Rows<const SourceInfo*> SourceTable::all()", "{", "    static const SourceInfo* const sources[] = {"]
    for source in table.sources:
        if not source.get("abstract"):
            call = f"{lower_first(source['name'])}Info()" if "class" in source else f"{source['name']}::info()"
            out.append(f"        &{call},")
    out += ["    };", "    return {sources, int(sizeof sources / sizeof *sources)};", "}", "",
            "Rows<Language> SourceTable::languages()", "{", f"    return {{languageRows, {len(languages)}}};", "}", "",
            "} // namespace AL2HMIBridge", ""]
    return "\n".join(out)


def markdown_type(item):
    kind = item["type"]
    if kind == "records":
        return f"array of `{item['record']}`"
    return {"bool": "boolean", "int": "integer", "real": "number", "text": "string", "intList": "array of integers"}.get(
        kind, f"integer, `{kind}`")


def markdown_default(table, source, item):
    enum = table.enum_of(source, item["type"])
    value = item.get("default")
    if enum:
        return str(next(v["value"] for v in enum["values"] if v["name"] == value))
    if item["type"] == "records":
        return "`[]`"
    if item["type"] == "intList":
        return f"`{value or []}`"
    return {"bool": "`true`" if value else "`false`", "text": f"`\"{value or ''}\"`"}.get(item["type"], str(value or 0))


def signature(item):
    return f"{item['name']}(" + ", ".join(f"{a['name']}: {markdown_type(a)}" for a in item.get("args", [])) + ")"


def extension_mark(item):
    return "" if item.get("contract") else " *"


def source_markdown(table, source):
    out = ["", f"### {source['name']}", "", source["brief"]
           + (f" Also has everything of `{source['base']}`." if "base" in source else "")
           + f" Channel `{source.get('channel', 'messages')}`."]
    for enum in source.get("enums", []):
        kind = "other numbers are accepted as well" if enum.get("open") else "other numbers are refused"
        values = ", ".join(f"{v['value']} {v.get('brief') or v['native']}" for v in enum["values"])
        out += ["", f"`{enum['name']}` ({kind}): {values}."]
    if source.get("state"):
        out += ["", "| State | Type | Default | Meaning |", "|---|---|---|---|"]
        for field in source["state"]:
            out.append(f"| `{field['name']}`{extension_mark(field)} | {markdown_type(field)} |"
                       f" {markdown_default(table, source, field)} | {field['brief']}{unit_note(field)} |")
    for kind, title in (("events", "Event"), ("calls", "Call")):
        if source.get(kind):
            out += ["", f"| {title} | Meaning |", "|---|---|"]
            out += [f"| `{signature(item).replace('`', '')}`{extension_mark(item)} | {call_doc(item).replace(chr(92) + 'a ', '')} |"
                    for item in source[kind]]
    return out


def markdown(table):
    out = ["", "### Records", "", "Every field must be there, and no other.", "", "| Record | Field | Type | Meaning |", "|---|---|---|---|"]
    for record in table.records.values():
        for field in record["fields"]:
            out.append(f"| `{record['name']}` | `{field['name']}` | {markdown_type(field)} | {field['brief']}{unit_note(field)} |")
    for source in table.sources:
        out += source_markdown(table, source)
    return "\n".join(out + [""])


def document_with_tables(table, path):
    text = path.read_text(encoding="utf-8")
    if text.count(DOC_BEGIN) != 1 or text.count(DOC_END) != 1:
        sys.exit(f"{path}: the marks around the tables are missing")
    before, rest = text.split(DOC_BEGIN)
    return text, before + DOC_BEGIN + "\n" + markdown(table) + "\n" + DOC_END + rest.split(DOC_END)[1]


def write_code(table, headers, code):
    headers.mkdir(parents=True, exist_ok=True)
    code.mkdir(parents=True, exist_ok=True)
    for source in table.classes():
        file = source["name"].lower() + ".h"
        (headers / file).write_text(header(table, source), encoding="utf-8")
        (headers / source["name"]).write_text(f'#include "{file}"\n', encoding="utf-8")
    (code / "sources.cpp").write_text(sources_cpp(table), encoding="utf-8")


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("table", type=pathlib.Path)
    parser.add_argument("--classes", action="store_true", help="list the names of the classes, separated by semicolons")
    parser.add_argument("--write", nargs=2, type=pathlib.Path, metavar=("HEADERS", "CODE"), help="write headers and sources.cpp")
    parser.add_argument("--check-doc", type=pathlib.Path, help="fail when the tables in this document are stale")
    parser.add_argument("--update-doc", type=pathlib.Path, help="bring the tables in this document up to date")
    arguments = parser.parse_args()
    table = Table(arguments.table)
    if arguments.classes:
        print(";".join(source["name"] for source in table.classes()), end="")
    if arguments.write:
        write_code(table, *arguments.write)
    if arguments.check_doc:
        old, new = document_with_tables(table, arguments.check_doc)
        if old != new:
            sys.exit(f"{arguments.check_doc}: the tables do not match {arguments.table.name}; run the target bridge-protocol-doc")
    if arguments.update_doc:
        arguments.update_doc.write_text(document_with_tables(table, arguments.update_doc)[1], encoding="utf-8")


if __name__ == "__main__":
    main()
