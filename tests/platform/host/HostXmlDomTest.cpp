// The host's DOM reader and writer over libxml2.
#include <gtest/gtest.h>

#include <cstdio>
#include <fstream>
#include <string>
#include <vector>

#include "TestHost.h"
#include "XmlTestSupport.h"
#include "tov/ITOVXmlDom.h"
#include "tov/ITOVXmlParser.h"
#include "tov/ITOVXmlWriter.h"

namespace {

using namespace UTIL;

class HostXmlDom : public ::testing::Test {
protected:
    TOVPtr<ITOVXmlParser> Parser() {
        TOVPtr<ITOVXmlParser> parser;
        EXPECT_EQ(host->CreateComponent(CompID_TOVXmlReader, nullptr, IID_ITOVXmlParser, parser.Out()), TOV_OK);
        return parser;
    }
    TOVPtr<ITOVXmlDomNode> Root(const std::string& text) {
        TOVPtr<ITOVXmlParser> parser = Parser();
        EXPECT_EQ(parser->ParseText(Str(text).Get()), TOV_OK);
        TOVPtr<ITOVUnknown> root;
        EXPECT_EQ(parser->GetRoot(root.OutT()), TOV_OK);
        TOVPtr<ITOVXmlDomNode> node;
        EXPECT_EQ(root->QueryInterface(IID_ITOVXmlDomNode, node.Out()), TOV_OK);
        return node;
    }
    static std::string Name(ITOVXmlDomNode* node) {
        TOVPtr<ITOVString> s;
        EXPECT_EQ(node->GetName(s.OutT()), TOV_OK);
        return Utf8(s.Get());
    }
    static std::string Value(ITOVXmlDomNode* node) {
        TOVPtr<ITOVString> s;
        EXPECT_EQ(node->GetValue(s.OutT()), TOV_OK);
        return Utf8(s.Get());
    }
    static TOVPtr<ITOVXmlDomNode> Child(ITOVXmlDomNode* node, uint32_t index) {
        TOVPtr<ITOVXmlDomNode> child;
        EXPECT_EQ(node->GetChild(index, child.OutT()), TOV_OK);
        return child;
    }

    TestHost host;
};

TEST_F(HostXmlDom, ChildrenKeepDocumentOrderAndTheirTypes) {
    TOVPtr<ITOVXmlDomNode> root =
        Root("<BWFXML><!-- made by hand --><SCENE>12A</SCENE>text<![CDATA[<raw>]]><?pi data?></BWFXML>");
    EXPECT_EQ(Name(root.Get()), "BWFXML");
    ASSERT_EQ(root->GetChildCount(), 5u);
    const struct {
        int32_t type;
        const char* name;
        const char* value;
    } expected[] = {
        {kTOVXmlComment, "#comment", " made by hand "},
        {kTOVXmlElement, "SCENE", ""},
        {kTOVXmlText, "#text", "text"},
        {kTOVXmlCDATA, "#cdata-section", "<raw>"},
        {kTOVXmlProcessingInstruction, "pi", "data"},
    };
    for (uint32_t i = 0; i < 5; ++i) {
        TOVPtr<ITOVXmlDomNode> child = Child(root.Get(), i);
        EXPECT_EQ(child->GetNodeType(), expected[i].type) << i;
        EXPECT_EQ(Name(child.Get()), expected[i].name) << i;
        EXPECT_EQ(Value(child.Get()), expected[i].value) << i;
    }
    TOVPtr<ITOVXmlDomNode> scene = Child(root.Get(), 1);
    EXPECT_EQ(Value(Child(scene.Get(), 0).Get()), "12A");
    void* out = reinterpret_cast<void*>(1);
    EXPECT_EQ(root->GetChild(5, reinterpret_cast<ITOVXmlDomNode**>(&out)), TOV_E_OUTOFRANGE);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(Name(Child(root.Get(), 4).Get()), "pi") << "children are still found after one past the end";
    EXPECT_EQ(Name(Child(root.Get(), 0).Get()), "#comment");
}

TEST_F(HostXmlDom, IndentationIsNotContent) {
    TOVPtr<ITOVXmlDomNode> root = Root("<BWFXML>\n  <SCENE>  </SCENE>\n  <NOTE>a <B>b</B> c</NOTE>\n</BWFXML>\n");
    ASSERT_EQ(root->GetChildCount(), 2u) << "the line breaks and indents between elements are gone";
    TOVPtr<ITOVXmlDomNode> scene = Child(root.Get(), 0);
    ASSERT_EQ(scene->GetChildCount(), 1u);
    EXPECT_EQ(Value(Child(scene.Get(), 0).Get()), "  ") << "a leaf element keeps its text as written";
    TOVPtr<ITOVXmlDomNode> note = Child(root.Get(), 1);
    ASSERT_EQ(note->GetChildCount(), 3u);
    EXPECT_EQ(Value(Child(note.Get(), 2).Get()), " c") << "mixed content keeps its spaces";
}

TEST_F(HostXmlDom, AttributesComeAsAListOfAttributeViews) {
    TOVPtr<ITOVXmlDomNode> root = Root(R"(<TRACK index="2" name="Boom &amp; mix"/>)");
    EXPECT_EQ(root->HasAttributes(), 1);
    TOVPtr<ITOVXmlDomNodeList> list;
    ASSERT_EQ(root->GetAttributes(list.OutT()), TOV_OK);
    ASSERT_EQ(list->GetCount(), 2u);
    TOVPtr<ITOVXmlDomNode> item;
    ASSERT_EQ(list->GetItem(1, item.OutT()), TOV_OK);
    EXPECT_EQ(item->GetNodeType(), kTOVXmlAttribute);
    TOVPtr<ITOVXmlDomAttribute> attribute;
    ASSERT_EQ(item->QueryInterface(IID_ITOVXmlDomAttribute, attribute.Out()), TOV_OK);
    TOVPtr<ITOVString> name, value;
    ASSERT_EQ(attribute->GetAttributeName(name.OutT()), TOV_OK);
    ASSERT_EQ(attribute->GetAttributeValue(value.OutT()), TOV_OK);
    EXPECT_EQ(Utf8(name.Get()), "name");
    EXPECT_EQ(Utf8(value.Get()), "Boom & mix");
    EXPECT_EQ(root->GetChildCount(), 0u) << "attributes are not children";

    TOVPtr<ITOVXmlDomElement> element;
    ASSERT_EQ(root->QueryInterface(IID_ITOVXmlDomElement, element.Out()), TOV_OK);
    TOVPtr<ITOVString> tag;
    ASSERT_EQ(element->GetTagName(tag.OutT()), TOV_OK);
    EXPECT_EQ(Utf8(tag.Get()), "TRACK");
    TOVPtr<ITOVXmlDomAttribute> notAnAttribute;
    EXPECT_EQ(root->QueryInterface(IID_ITOVXmlDomAttribute, notAnAttribute.Out()), TOV_E_NOINTERFACE);
}

TEST_F(HostXmlDom, TextIsUnicodeWhateverTheDeclarationSays) {
    TOVPtr<ITOVXmlDomNode> root = Root("<?xml version=\"1.0\" encoding=\"ISO-8859-1\"?><NOTE>Grüße 😀</NOTE>");
    EXPECT_EQ(Value(Child(root.Get(), 0).Get()), "Grüße 😀");
}

TEST_F(HostXmlDom, AFileIsReadInItsDeclaredEncoding) {
    const std::string path = ::testing::TempDir() + "latin1.xml";
    {
        std::ofstream file(path, std::ios::binary);
        file << "<?xml version=\"1.0\" encoding=\"ISO-8859-1\"?><NOTE>Gr\xFC\xDF"
                "e</NOTE>";
    }
    TOVPtr<ITOVXmlParser> parser = Parser();
    ASSERT_EQ(parser->ParseFile(Str(path).Get()), TOV_OK);
    TOVPtr<ITOVUnknown> root;
    ASSERT_EQ(parser->GetRoot(root.OutT()), TOV_OK);
    TOVPtr<ITOVXmlDomNode> node;
    ASSERT_EQ(root->QueryInterface(IID_ITOVXmlDomNode, node.Out()), TOV_OK);
    EXPECT_EQ(Value(Child(node.Get(), 0).Get()), "Grüße");
    std::remove(path.c_str());
}

TEST_F(HostXmlDom, NodesOutliveTheirParser) {
    TOVPtr<ITOVXmlDomNode> scene;
    {
        TOVPtr<ITOVXmlDomNode> root = Root("<BWFXML><SCENE>7</SCENE></BWFXML>");
        scene = Child(root.Get(), 0);
    }
    EXPECT_EQ(Value(Child(scene.Get(), 0).Get()), "7");
}

struct BadDocument {
    const char* name;
    const char* text;
};

TEST_F(HostXmlDom, MalformedTextFailsWithAReason) {
    const BadDocument cases[] = {
        {"empty", ""},
        {"unclosed", "<BWFXML><SCENE>1</BWFXML>"},
        {"two roots", "<A/><B/>"},
        {"undeclared entity", "<A>&nope;</A>"},
        {"text only", "just words"},
    };
    for (const BadDocument& c : cases) {
        TOVPtr<ITOVXmlParser> parser = Parser();
        EXPECT_EQ(parser->ParseText(Str(c.text).Get()), TOV_E_FAIL) << c.name;
        TOVPtr<ITOVString> error;
        ASSERT_EQ(parser->GetLastError(error.OutT()), TOV_OK);
        EXPECT_FALSE(Utf8(error.Get()).empty()) << c.name;
        TOVPtr<ITOVUnknown> root;
        EXPECT_EQ(parser->GetRoot(root.OutT()), ZEB_E_NOTREADY) << c.name;
    }
}

TEST_F(HostXmlDom, MissingFileAndMissingTextAreRefused) {
    TOVPtr<ITOVXmlParser> parser = Parser();
    EXPECT_EQ(parser->ParseFile(Str("/nonexistent/take1.xml").Get()), TOV_E_FILEOPEN);
    TOVPtr<ITOVString> error;
    ASSERT_EQ(parser->GetLastError(error.OutT()), TOV_OK);
    EXPECT_NE(Utf8(error.Get()).find("/nonexistent/take1.xml"), std::string::npos);
    EXPECT_EQ(parser->ParseText(nullptr), TOV_E_POINTER);
}

class HostXmlWriterTest : public HostXmlDom {
protected:
    TOVPtr<ITOVXmlWriter> Writer() {
        TOVPtr<ITOVXmlWriter> writer;
        EXPECT_EQ(host->CreateComponent(CompID_TOVXmlWriter, nullptr, IID_ITOVXmlWriter, writer.Out()), TOV_OK);
        return writer;
    }
};

TEST_F(HostXmlWriterTest, ElementsNestByTheTagOfTheirParent) {
    TOVPtr<ITOVXmlWriter> writer = Writer();
    ASSERT_EQ(writer->Open(nullptr), TOV_OK);
    ASSERT_EQ(writer->WriteElement(Str("BWFXML").Get(), nullptr), TOV_OK);
    ASSERT_EQ(writer->WriteElement(Str("TRACK_LIST").Get(), Str("BWFXML").Get()), TOV_OK);
    for (const char* name : {"Boom", "Lav <1> & \"2\""}) {
        ASSERT_EQ(writer->WriteElement(Str("TRACK").Get(), Str("TRACK_LIST").Get()), TOV_OK);
        ASSERT_EQ(writer->WriteAttribute(Str("name").Get(), Str(name).Get(), Str("TRACK").Get()), TOV_OK);
        ASSERT_EQ(writer->WriteText(Str(name).Get(), Str("TRACK").Get()), TOV_OK);
    }
    TOVPtr<ITOVString> text;
    ASSERT_EQ(writer->GetText(text.OutT()), TOV_OK);
    const std::string xml = Utf8(text.Get());
    EXPECT_EQ(xml,
              "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
              "<BWFXML>\n"
              "  <TRACK_LIST>\n"
              "    <TRACK name=\"Boom\">Boom</TRACK>\n"
              "    <TRACK name=\"Lav &lt;1&gt; &amp; &quot;2&quot;\">Lav &lt;1&gt; &amp; \"2\"</TRACK>\n"
              "  </TRACK_LIST>\n"
              "</BWFXML>\n");
    // What the writer writes, the reader reads back.
    TOVPtr<ITOVXmlDomNode> root = Root(xml);
    EXPECT_EQ(Name(root.Get()), "BWFXML");
}

TEST_F(HostXmlWriterTest, MisuseIsRefused) {
    TOVPtr<ITOVXmlWriter> writer = Writer();
    EXPECT_EQ(writer->WriteElement(Str("A").Get(), nullptr), ZEB_E_NOTREADY);
    TOVPtr<ITOVString> text;
    EXPECT_EQ(writer->GetText(text.OutT()), ZEB_E_NOTREADY);
    ASSERT_EQ(writer->Open(nullptr), TOV_OK);
    EXPECT_EQ(writer->WriteElement(Str("not a name").Get(), nullptr), TOV_E_INVALIDARG);
    ASSERT_EQ(writer->WriteElement(Str("A").Get(), nullptr), TOV_OK);
    EXPECT_EQ(writer->WriteElement(Str("B").Get(), nullptr), ZEB_E_ALREADYSET);
    EXPECT_EQ(writer->WriteElement(Str("C").Get(), Str("missing").Get()), ZEB_E_NOTFOUND);
    EXPECT_EQ(writer->WriteText(Str("x").Get(), Str("missing").Get()), ZEB_E_NOTFOUND);
    EXPECT_EQ(writer->WriteAttribute(Str("a").Get(), Str("1").Get(), nullptr), TOV_E_POINTER);
}

TEST_F(HostXmlWriterTest, CloseWritesTheFile) {
    const std::string path = ::testing::TempDir() + "written.xml";
    TOVPtr<ITOVXmlWriter> writer = Writer();
    ASSERT_EQ(writer->Open(Str(path).Get()), TOV_OK);
    ASSERT_EQ(writer->WriteElement(Str("SCMain").Get(), nullptr), TOV_OK);
    ASSERT_EQ(writer->Close(), TOV_OK);
    TOVPtr<ITOVXmlParser> parser = Parser();
    EXPECT_EQ(parser->ParseFile(Str(path).Get()), TOV_OK);
    std::remove(path.c_str());

    ASSERT_EQ(writer->Open(Str("/nonexistent/dir/out.xml").Get()), TOV_OK);
    ASSERT_EQ(writer->WriteElement(Str("SCMain").Get(), nullptr), TOV_OK);
    EXPECT_EQ(writer->Close(), TOV_E_FILEIO);
}

}  // namespace
