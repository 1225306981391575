#pragma once

#include "plinth/cli/Formatter.h"

namespace Plinth {
namespace Cli {

// Nested "Title: value" text; each structure under its title line, fields
// indented three spaces; a list of structures as blocks separated by a blank
// line. A boolean prints nothing for true and "false" for false.
class SimpleFormatter : public Formatter {
public:
    void Write(std::ostream& out, boost::shared_ptr<MetaObj::MetaObject> const& result,
               boost::shared_ptr<MetaObj::MetaObject> const& shape, FormatHints const& hints) const override;
};

// A header row of titles, a row of dashes, one row per structure; columns
// two spaces apart, padded to the widest cell, trailing blanks stripped.
class TableFormatter : public Formatter {
public:
    void Write(std::ostream& out, boost::shared_ptr<MetaObj::MetaObject> const& result,
               boost::shared_ptr<MetaObj::MetaObject> const& shape, FormatHints const& hints) const override;
};

// One JSON document on one line: structures as objects keyed by field title
// in declaration order, lists as arrays, unset values as null. Hints are not
// applied: every field is shown.
class JsonFormatter : public Formatter {
public:
    void Write(std::ostream& out, boost::shared_ptr<MetaObj::MetaObject> const& result,
               boost::shared_ptr<MetaObj::MetaObject> const& shape, FormatHints const& hints) const override;
};

// An XML document: <output> holding one <structure name="...">, <list>,
// <string>, <integer> or <boolean> element; a structure holds one
// <field name="..."> per field, empty for an unset value.
class XmlFormatter : public Formatter {
public:
    void Write(std::ostream& out, boost::shared_ptr<MetaObj::MetaObject> const& result,
               boost::shared_ptr<MetaObj::MetaObject> const& shape, FormatHints const& hints) const override;
};

// A header row of field titles (the table's columns) and one row per
// structure, quoted as RFC 4180 says; nested values in their one-line form.
class CsvFormatter : public Formatter {
public:
    void Write(std::ostream& out, boost::shared_ptr<MetaObj::MetaObject> const& result,
               boost::shared_ptr<MetaObj::MetaObject> const& shape, FormatHints const& hints) const override;
};

// One "Struct.Field.type=value" line per value; "[]" marks the elements of a
// list ("VM.Networks[].string=Guest Network"); types are string, integer and
// boolean.
class KeyValueFormatter : public Formatter {
public:
    void Write(std::ostream& out, boost::shared_ptr<MetaObj::MetaObject> const& result,
               boost::shared_ptr<MetaObj::MetaObject> const& shape, FormatHints const& hints) const override;
};

}  // namespace Cli
}  // namespace Plinth
