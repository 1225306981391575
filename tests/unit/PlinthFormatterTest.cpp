// The formatters on the shapes commands deliver: a structure, a list of
// structures, nested lists and structures, unset fields, booleans; the hints
// that choose fields, titles and units; and texts holding markup characters,
// line breaks, controls, wide characters and bytes that are not UTF-8. An
// empty table with its shape is proven through the test plug-in in
// tests/cli/frame.test.sh.
#include <gtest/gtest.h>

#include <regex>
#include <sstream>

#include "plinth/Plinth.h"
#include "plinth/cli/Formatter.h"
#include "plinth/cli/Utf8.h"

using namespace Plinth::MetaObj;
using Plinth::Cli::FormatHints;

namespace {

typedef std::map<std::string, std::string> Hints;

std::string Render(std::string const& name, boost::shared_ptr<MetaObject> result, Hints const& hints = Hints(),
                   boost::shared_ptr<MetaObject> shape = boost::shared_ptr<MetaObject>()) {
    std::unique_ptr<Plinth::Cli::Formatter> formatter = Plinth::Cli::MakeFormatter(name);
    if (!formatter) throw std::runtime_error("no formatter " + name);
    std::ostringstream out;
    formatter->Write(out, result, shape, FormatHints(hints));
    return out.str();
}

boost::shared_ptr<MetaStruct> RulesetShape() {
    boost::shared_ptr<MetaStruct> ruleset = MetaStruct::New("Ruleset");
    ruleset->SetField("Name", MetaString::New());
    ruleset->SetField("Enabled", MetaBool::New());
    ruleset->SetField("Ports", MetaList::New(2));
    ruleset->SetField("Timeout", MetaInt::New());
    return ruleset;
}

boost::shared_ptr<MetaStruct> Ruleset(std::string const& name, bool enabled, std::vector<std::string> const& ports) {
    boost::shared_ptr<MetaStruct> ruleset = RulesetShape();
    ruleset->SetField("Name", name);
    ruleset->SetField("Enabled", enabled);
    ruleset->SetField("Ports", ports);
    return ruleset;
}

boost::shared_ptr<MetaList> Rulesets() {
    boost::shared_ptr<MetaList> list = MetaList::New(3, RulesetShape());
    list->AddMetaStruct(Ruleset("sshServer", false, {"22"}));
    list->AddMetaStruct(Ruleset("dns", true, {"53", "5353"}));
    return list;
}

// A structure with a nested structure and a nested list of structures.
boost::shared_ptr<MetaStruct> Switch() {
    boost::shared_ptr<MetaStruct> policy = MetaStruct::New("ShapingPolicy");
    policy->SetField("Enabled", true);
    policy->SetField("Average Bandwidth", 100);
    boost::shared_ptr<MetaList> groups = MetaList::New(3, MetaStruct::New("PortGroup"));
    for (char const* name : {"Host Management", "Guest Network"}) {
        boost::shared_ptr<MetaStruct> group = MetaStruct::New("PortGroup");
        group->SetField("Name", name);
        groups->AddMetaStruct(group);
    }
    boost::shared_ptr<MetaStruct> vswitch = MetaStruct::New("VirtualSwitch");
    vswitch->SetField("Name", "switch0");
    vswitch->SetField("Policy", policy);
    vswitch->SetField("Portgroups", groups);
    vswitch->SetField("Uplinks", std::vector<std::string>{"pnet0", "pnet1"});
    return vswitch;
}

// Element text or an attribute value: no markup except the references the
// xml formatter writes.
bool IsPlainXmlText(std::string const& text) {
    static std::regex const reference("&(amp|lt|gt|quot|#x(9|A|D|[2-9A-F][0-9A-F]));");
    return std::regex_replace(text, reference, "").find_first_of("<&") == std::string::npos;
}

// Why xml is not well-formed as the xml formatter writes it (a declaration,
// then one root of elements with at most a name attribute); "" when it is.
std::string XmlProblem(std::string const& xml) {
    std::size_t at = 0;
    for (char32_t c = 0; at < xml.size();) {
        if (!Plinth::Cli::NextCodePoint(xml, at, c)) return "not UTF-8";
        if (c < 0x20 ? c != '\t' && c != '\n' && c != '\r' : c == 0xFFFE || c == 0xFFFF) return "a forbidden character";
    }
    std::string const declaration = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n";
    if (xml.compare(0, declaration.size(), declaration) != 0) return "no declaration";
    static std::regex const tag(R"re(<(/?)([a-z]+)(?: name="([^"]*)")?(/?)>)re");
    std::vector<std::string> open;
    int roots = 0;
    std::string rest = xml.substr(declaration.size());
    for (std::smatch m; std::regex_search(rest, m, tag); rest = m.suffix()) {
        bool const outside = open.empty() && m.prefix().str().find_first_not_of("\n") != std::string::npos;
        if (outside || !IsPlainXmlText(m.prefix()) || !IsPlainXmlText(m[3])) return "bad text before " + m.str();
        if (m[1].length() > 0) {
            if (open.empty() || open.back() != m[2]) return "unbalanced " + m.str();
            open.pop_back();
        } else if (open.empty() && roots++ > 0) {
            return "a second root";
        } else if (m[4].length() == 0) {
            open.push_back(m[2]);
        }
    }
    return open.empty() && roots == 1 && rest == "\n" ? "" : "an unclosed element";
}

}  // namespace

TEST(PlinthJsonFormatter, KeysInDeclarationOrderUnsetAsNullOneLine) {
    EXPECT_EQ("[{\"Name\":\"sshServer\",\"Enabled\":false,\"Ports\":[\"22\"],\"Timeout\":null},"
              "{\"Name\":\"dns\",\"Enabled\":true,\"Ports\":[\"53\",\"5353\"],\"Timeout\":null}]\n",
              Render("json", Rulesets(), {{"fields:Ruleset", "Name"}}));
    EXPECT_EQ("{\"Name\":\"switch0\",\"Policy\":{\"Enabled\":true,\"Average Bandwidth\":100},"
              "\"Portgroups\":[{\"Name\":\"Host Management\"},{\"Name\":\"Guest Network\"}],"
              "\"Uplinks\":[\"pnet0\",\"pnet1\"]}\n",
              Render("json", Switch()));

    boost::shared_ptr<MetaStruct> odd = MetaStruct::New("Odd");
    odd->SetField("Text \"quoted\"", "line\nbreak\\");
    odd->SetField("Missing", boost::shared_ptr<MetaString>());
    EXPECT_EQ("{\"Text \\\"quoted\\\"\":\"line\\nbreak\\\\\",\"Missing\":null}\n", Render("json", odd));
}

TEST(PlinthJsonFormatter, BooleanResults) {
    EXPECT_EQ("true\n", Render("json", MetaBool::New(true)));
    EXPECT_EQ("false\n", Render("json", MetaBool::New(false)));
    EXPECT_EQ("null\n", Render("json", MetaBool::New()));
    EXPECT_EQ("[]\n", Render("json", MetaList::New(3, RulesetShape())));
}

TEST(PlinthSimpleFormatter, StructureUnderItsNameWithUnsetFieldsEmpty) {
    EXPECT_EQ("Ruleset\n"
              "   Name: dns\n"
              "   Enabled: true\n"
              "   Ports: 53, 5353\n"
              "   Timeout:\n",
              Render("simple", Ruleset("dns", true, {"53", "5353"})));
}

TEST(PlinthSimpleFormatter, NestedStructuresIndentOneStepFurtherAndBlocksAreSeparatedByABlankLine) {
    EXPECT_EQ("VirtualSwitch\n"
              "   Name: switch0\n"
              "   Policy:\n"
              "      ShapingPolicy\n"
              "         Enabled: true\n"
              "         Average Bandwidth: 100\n"
              "   Portgroups:\n"
              "      PortGroup\n"
              "         Name: Host Management\n"
              "\n"
              "      PortGroup\n"
              "         Name: Guest Network\n"
              "   Uplinks: pnet0, pnet1\n",
              Render("simple", Switch()));
}

TEST(PlinthSimpleFormatter, ListOfStructuresAsBlocksWithFieldAndHeaderHints) {
    EXPECT_EQ("Ruleset sshServer (false)\n"
              "   Enabled: false\n"
              "   Name: sshServer\n"
              "\n"
              "Ruleset dns (true)\n"
              "   Enabled: true\n"
              "   Name: dns\n",
              Render("simple", Rulesets(),
                     {{"fields:Ruleset", "Enabled, Name,Unknown"}, {"header:Ruleset", "Ruleset %Name% (%Enabled%)"}}));
    EXPECT_EQ("Rules of sshServer, %Owner%\n"
              "   Name: sshServer\n"
              "\n"
              "Rules of dns, %Owner%\n"
              "   Name: dns\n",
              Render("simple", Rulesets(), {{"fields:Ruleset", "Name"}, {"header:Ruleset", "Rules of %Name%, %Owner%"}}));
    EXPECT_EQ("   Name: sshServer\n\n   Name: dns\n",
              Render("simple", Rulesets(), {{"fields:Ruleset", "Name"}, {"header:Ruleset", "<NONE>"}}));
}

TEST(PlinthSimpleFormatter, BooleanResultPrintsOnlyFalse) {
    EXPECT_EQ("", Render("simple", MetaBool::New(true)));
    EXPECT_EQ("false\n", Render("simple", MetaBool::New(false)));
    EXPECT_EQ("", Render("simple", MetaBool::New()));
    EXPECT_EQ("", Render("table", MetaBool::New(true)));
    EXPECT_EQ("false\n", Render("table", MetaBool::New(false)));
}

TEST(PlinthTableFormatter, PaddedColumnsDashesAndNoTrailingBlanks) {
    EXPECT_EQ("Name       Enabled  Ports     Timeout\n"
              "---------  -------  --------  -------\n"
              "sshServer  false    22\n"
              "dns        true     53, 5353\n",
              Render("table", Rulesets()));
}

TEST(PlinthTableFormatter, ColumnHintsUnitsAndNestedCells) {
    Hints const hints{{"fields:Ruleset", "Name,Enabled"}, {"units:Ruleset.Timeout", "sec"}};
    EXPECT_EQ("Name       Enabled\n---------  -------\nsshServer  false\ndns        true\n",
              Render("table", Rulesets(), hints));
    // The top-level column hint wins over the fields of the structure.
    boost::shared_ptr<MetaList> list = Rulesets();
    boost::dynamic_pointer_cast<MetaStruct>(list->GetElements()[0])->SetField("Timeout", 30);
    EXPECT_EQ("Timeout  Name\n-------  ---------\n30 sec   sshServer\n         dns\n",
              Render("table", list, {{"table-columns", "Timeout,Name"}, {"units:Ruleset.Timeout", "sec"}}));
    // A nested structure fills one cell, with its own column hint.
    EXPECT_EQ("Name     Policy\n"
              "-------  -----------------------------\n"
              "switch0  {Average Bandwidth: 100 Kbps}\n",
              Render("table", Switch(),
                     {{"table-columns", "Name,Policy"},
                      {"table-columns:ShapingPolicy", "Average Bandwidth"},
                      {"units:ShapingPolicy.Average Bandwidth", "Kbps"}}));
}

TEST(PlinthTableFormatter, AnEmptyListWithoutAShapeTakesTheOutputSpecifications) {
    boost::shared_ptr<MetaList> bare = MetaList::New(META_STRUCT);
    EXPECT_EQ("Name  Enabled\n----  -------\n",
              Render("table", bare, {{"fields:Ruleset", "Name,Enabled"}}, MetaList::New(3, RulesetShape())));
}

TEST(PlinthCsvFormatter, HeaderRowAndQuotedCells) {
    boost::shared_ptr<MetaList> list = Rulesets();
    list->AddMetaStruct(Ruleset("say \"hi\", then\nleave", true, {}));
    EXPECT_EQ("Name,Enabled,Ports,Timeout\n"
              "sshServer,false,22,\n"
              "dns,true,\"53, 5353\",\n"
              "\"say \"\"hi\"\", then\nleave\",true,,\n",
              Render("csv", list));
    EXPECT_EQ("true\n", Render("csv", MetaBool::New(true)));
}

TEST(PlinthXmlFormatter, ElementsPerValueKindEscapedAndUnsetEmpty) {
    boost::shared_ptr<MetaStruct> rule = MetaStruct::New("Rule");
    rule->SetField("Name", "a<b & \"c\"");
    rule->SetField("Port", 22);
    rule->SetField("Unset", MetaBool::New());
    rule->SetField("Tags", std::vector<std::string>{"x"});
    EXPECT_EQ("<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
              "<output>\n"
              "  <structure name=\"Rule\">\n"
              "    <field name=\"Name\">\n"
              "      <string>a&lt;b &amp; &quot;c&quot;</string>\n"
              "    </field>\n"
              "    <field name=\"Port\">\n"
              "      <integer>22</integer>\n"
              "    </field>\n"
              "    <field name=\"Unset\"/>\n"
              "    <field name=\"Tags\">\n"
              "      <list>\n"
              "        <string>x</string>\n"
              "      </list>\n"
              "    </field>\n"
              "  </structure>\n"
              "</output>\n",
              Render("xml", rule));
    EXPECT_NE(std::string::npos, Render("xml", MetaBool::New(false)).find("<boolean>false</boolean>"));
}

TEST(PlinthKeyValueFormatter, OneTypedLinePerValue) {
    EXPECT_EQ("VirtualSwitch.Name.string=switch0\n"
              "VirtualSwitch.Policy.Enabled.boolean=true\n"
              "VirtualSwitch.Policy.Average Bandwidth.integer=100\n"
              "VirtualSwitch.Portgroups[].Name.string=Host Management\n"
              "VirtualSwitch.Portgroups[].Name.string=Guest Network\n"
              "VirtualSwitch.Uplinks[].string=pnet0\n"
              "VirtualSwitch.Uplinks[].string=pnet1\n",
              Render("keyvalue", Switch()));
    EXPECT_EQ("Ruleset.Name.string=dns\nRuleset.Enabled.boolean=true\nRuleset.Ports[].string=53\n"
              "Ruleset.Timeout.integer=\n",
              Render("keyvalue", Ruleset("dns", true, {"53"})));
    EXPECT_EQ("boolean=false\n", Render("keyvalue", MetaBool::New(false)));
}

TEST(PlinthFormatters, MarkupLineBreaksControlsWideCharactersAndInvalidBytesInEveryFormat) {
    boost::shared_ptr<MetaStruct> odd = MetaStruct::New("R&D \"lab\"");
    odd->SetField("Name", "a \"q\" <b> & 東京\nx");
    odd->SetField("Raw\nbytes", "C:\\x\t\r\x07\x7f\u2028\xE6\x9D");  // the last two bytes are not UTF-8
    EXPECT_EQ("{\"Name\":\"a \\\"q\\\" <b> & 東京\\nx\",\"Raw\\nbytes\":\"C:\\\\x\\t\\r\\u0007\x7f\u2028\uFFFD\"}\n",
              Render("json", odd));
    EXPECT_EQ("Name,\"Raw\nbytes\"\n\"a \"\"q\"\" <b> & 東京\nx\",\"C:\\x\t\r\x07\x7f\u2028\uFFFD\uFFFD\"\n",
              Render("csv", odd));
    EXPECT_EQ("R&D \"lab\".Name.string=a \"q\" <b> & 東京\\nx\n"
              "R&D \"lab\".Raw\\nbytes.string=C:\\\\x\\t\\r\\u0007\\u007f\\u2028\uFFFD\uFFFD\n",
              Render("keyvalue", odd));
    EXPECT_EQ("R&D \"lab\"\n"
              "   Name: a \"q\" <b> & 東京\\nx\n"
              "   Raw\\nbytes: C:\\\\x\\t\\r\\u0007\\u007f\\u2028\uFFFD\uFFFD\n",
              Render("simple", odd));
    EXPECT_EQ("Name                 Raw\\nbytes\n"
              "-------------------  -----------------------------\n"
              "a \"q\" <b> & 東京\\nx  C:\\\\x\\t\\r\\u0007\\u007f\\u2028\uFFFD\uFFFD\n",
              Render("table", odd));
    std::string const xml = Render("xml", odd);
    EXPECT_EQ("", XmlProblem(xml)) << xml;
    EXPECT_EQ("<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
              "<output>\n"
              "  <structure name=\"R&amp;D &quot;lab&quot;\">\n"
              "    <field name=\"Name\">\n"
              "      <string>a &quot;q&quot; &lt;b&gt; &amp; 東京&#xA;x</string>\n"
              "    </field>\n"
              "    <field name=\"Raw&#xA;bytes\">\n"
              "      <string>C:\\x&#x9;&#xD;\uFFFD&#x7F;\u2028\uFFFD\uFFFD</string>\n"
              "    </field>\n"
              "  </structure>\n"
              "</output>\n",
              xml);
}

TEST(PlinthTableFormatter, AlignsByDisplayWidthAndEscapesLineBreaks) {
    boost::shared_ptr<MetaList> list = MetaList::New(3, RulesetShape());
    list->AddMetaStruct(Ruleset("東京", true, {"22"}));
    list->AddMetaStruct(Ruleset("Cafe\u0301", true, {"53"}));  // a combining accent
    EXPECT_EQ("Name  Ports\n"
              "----  -----\n"
              "東京  22\n"
              "Cafe\u0301  53\n",
              Render("table", list, {{"fields:Ruleset", "Name,Ports"}}));
    EXPECT_EQ("one\\ntwo\n", Render("table", MetaString::New("one\ntwo")));
}
