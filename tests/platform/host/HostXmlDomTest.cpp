// The host's DOM reader and writer over libxml2.
#include <gtest/gtest.h>

#include <cstdio>
#include <fstream>
#include <string>
#include <vector>

#include "TestHost.h"
#include "XmlTestSupport.h"
#include "tov/ITOVXmlWriter.h"

namespace {

using namespace UTIL;

class HostXmlDom : public ::testing::Test {
protected:
    TOVPtr<ITOVXmlDomNode> Root(const std::string& text) {
        TOVPtr<ITOVXmlParser> parser = NewDomReader(host.Get());
        EXPECT_EQ(parser->ParseText(Str(text).Get()), TOV_OK);
        return RootOf(parser.Get());
    }

    TestHost host;
};

TEST_F(HostXmlDom, ChildrenKeepDocumentOrderAndTheirTypes) {
    TOVPtr<ITOVXmlDomNode> root =
        Root("<BWFXML><!-- made by hand --><SCENE>12A</SCENE>text<![CDATA[<raw>]]><?pi data?></BWFXML>");
    EXPECT_EQ(NameOf(root), "BWFXML");
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
        SCOPED_TRACE(i);
        TOVPtr<ITOVXmlDomNode> child = ChildOf(root, i);
        EXPECT_EQ(child->GetNodeType(), expected[i].type);
        EXPECT_EQ(NameOf(child), expected[i].name);
        EXPECT_EQ(ValueOf(child), expected[i].value);
    }
    EXPECT_EQ(ValueOf(ChildOf(ChildOf(root, 1), 0)), "12A");
    void* out = reinterpret_cast<void*>(1);
    EXPECT_EQ(root->GetChild(5, reinterpret_cast<ITOVXmlDomNode**>(&out)), TOV_E_OUTOFRANGE);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(NameOf(ChildOf(root, 4)), "pi") << "children are still found after one past the end";
    EXPECT_EQ(NameOf(ChildOf(root, 0)), "#comment");
}

TEST_F(HostXmlDom, IndentationIsNotContent) {
    TOVPtr<ITOVXmlDomNode> root = Root("<BWFXML>\n  <SCENE>  </SCENE>\n  <NOTE>a <B>b</B> c</NOTE>\n</BWFXML>\n");
    ASSERT_EQ(root->GetChildCount(), 2u) << "the line breaks and indents between elements are gone";
    TOVPtr<ITOVXmlDomNode> scene = ChildOf(root, 0);
    ASSERT_EQ(scene->GetChildCount(), 1u);
    EXPECT_EQ(ValueOf(ChildOf(scene, 0)), "  ") << "a leaf element keeps its text as written";
    TOVPtr<ITOVXmlDomNode> note = ChildOf(root, 1);
    ASSERT_EQ(note->GetChildCount(), 3u);
    EXPECT_EQ(ValueOf(ChildOf(note, 2)), " c") << "mixed content keeps its spaces";
}

TEST_F(HostXmlDom, AttributesComeAsAListOfAttributeViews) {
    TOVPtr<ITOVXmlDomNode> root = Root(R"(<TRACK index="2" name="Boom &amp; mix"/>)");
    EXPECT_EQ(root->HasAttributes(), 1);
    EXPECT_EQ(root->GetChildCount(), 0u) << "attributes are not children";
    TOVPtr<ITOVXmlDomNodeList> list;
    ASSERT_EQ(root->GetAttributes(list.OutT()), TOV_OK);
    ASSERT_EQ(list->GetCount(), 2u);
    TOVPtr<ITOVXmlDomNode> item;
    ASSERT_EQ(list->GetItem(1, item.OutT()), TOV_OK);
    EXPECT_EQ(item->GetNodeType(), kTOVXmlAttribute);
    TOVPtr<ITOVXmlDomAttribute> attribute;
    ASSERT_EQ(item->QueryInterface(IID_ITOVXmlDomAttribute, attribute.Out()), TOV_OK);
    EXPECT_EQ(TextOf(attribute.Get(), &ITOVXmlDomAttribute::GetAttributeName), "name");
    EXPECT_EQ(TextOf(attribute.Get(), &ITOVXmlDomAttribute::GetAttributeValue), "Boom & mix");

    TOVPtr<ITOVXmlDomElement> element;
    ASSERT_EQ(root->QueryInterface(IID_ITOVXmlDomElement, element.Out()), TOV_OK);
    EXPECT_EQ(TextOf(element.Get(), &ITOVXmlDomElement::GetTagName), "TRACK");
    EXPECT_EQ(root->QueryInterface(IID_ITOVXmlDomAttribute, attribute.Out()), TOV_E_NOINTERFACE);
}

TEST_F(HostXmlDom, TextIsUnicodeAndAFileIsReadInItsDeclaredEncoding) {
    const std::string declaration = "<?xml version=\"1.0\" encoding=\"ISO-8859-1\"?>";
    EXPECT_EQ(ValueOf(ChildOf(Root(declaration + "<NOTE>Grüße 😀</NOTE>"), 0)), "Grüße 😀");

    const std::string path = ::testing::TempDir() + "latin1.xml";
    std::ofstream(path, std::ios::binary) << declaration << "<NOTE>Gr\xFC\xDF"
                                          << "e</NOTE>";
    TOVPtr<ITOVXmlParser> parser = NewDomReader(host.Get());
    ASSERT_EQ(parser->ParseFile(Str(path).Get()), TOV_OK);
    EXPECT_EQ(ValueOf(ChildOf(RootOf(parser.Get()), 0)), "Grüße");
    std::remove(path.c_str());
    EXPECT_EQ(parser->ParseFile(Str(path).Get()), TOV_E_FILEOPEN);
    EXPECT_NE(LastError(parser.Get()).find(path), std::string::npos);
}

TEST_F(HostXmlDom, NodesOutliveTheirParser) {
    // The parser and the root are gone at the end of this line.
    const TOVPtr<ITOVXmlDomNode> scene = ChildOf(Root("<BWFXML><SCENE>7</SCENE></BWFXML>"), 0);
    EXPECT_EQ(ValueOf(ChildOf(scene, 0)), "7");
}

TEST_F(HostXmlDom, MalformedTextFailsWithAReason) {
    TOVPtr<ITOVXmlParser> parser = NewDomReader(host.Get());
    EXPECT_EQ(parser->ParseText(nullptr), TOV_E_POINTER);
    for (const char* text : {"", "<BWFXML><SCENE>1</BWFXML>", "<A/><B/>", "<A>&nope;</A>", "just words"}) {
        SCOPED_TRACE(text);
        EXPECT_EQ(parser->ParseText(Str(text).Get()), TOV_E_FAIL);
        EXPECT_FALSE(LastError(parser.Get()).empty());
        TOVPtr<ITOVUnknown> root;
        EXPECT_EQ(parser->GetRoot(root.OutT()), ZEB_E_NOTREADY);
    }
}

class HostXmlWriter : public HostXmlDom {
protected:
    TOVPtr<ITOVXmlWriter> writer = NewComponent<ITOVXmlWriter>(host.Get(), CompID_TOVXmlWriter, IID_ITOVXmlWriter);
};

TEST_F(HostXmlWriter, ElementsNestByTheTagOfTheirParent) {
    ASSERT_EQ(writer->Open(nullptr), TOV_OK);
    ASSERT_EQ(writer->WriteElement(Str("BWFXML").Get(), nullptr), TOV_OK);
    ASSERT_EQ(writer->WriteElement(Str("TRACK_LIST").Get(), Str("BWFXML").Get()), TOV_OK);
    for (const char* name : {"Boom", "Lav <1> & \"2\""}) {
        ASSERT_EQ(writer->WriteElement(Str("TRACK").Get(), Str("TRACK_LIST").Get()), TOV_OK);
        ASSERT_EQ(writer->WriteAttribute(Str("name").Get(), Str(name).Get(), Str("TRACK").Get()), TOV_OK);
        ASSERT_EQ(writer->WriteText(Str(name).Get(), Str("TRACK").Get()), TOV_OK);
    }
    const std::string xml = TextOf(writer.Get(), &ITOVXmlWriter::GetText);
    EXPECT_EQ(xml,
              "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
              "<BWFXML>\n"
              "  <TRACK_LIST>\n"
              "    <TRACK name=\"Boom\">Boom</TRACK>\n"
              "    <TRACK name=\"Lav &lt;1&gt; &amp; &quot;2&quot;\">Lav &lt;1&gt; &amp; \"2\"</TRACK>\n"
              "  </TRACK_LIST>\n"
              "</BWFXML>\n");
    EXPECT_EQ(NameOf(Root(xml)), "BWFXML") << "what the writer writes, the reader reads back";
}

TEST_F(HostXmlWriter, MisuseIsRefused) {
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

TEST_F(HostXmlWriter, CloseWritesTheFile) {
    const std::string path = ::testing::TempDir() + "written.xml";
    for (const std::string& target : {path, std::string("/nonexistent/dir/out.xml")}) {
        ASSERT_EQ(writer->Open(Str(target).Get()), TOV_OK);
        ASSERT_EQ(writer->WriteElement(Str("SCMain").Get(), nullptr), TOV_OK);
        EXPECT_EQ(writer->Close(), target == path ? TOV_OK : TOV_E_FILEIO);
    }
    EXPECT_EQ(NewDomReader(host.Get())->ParseFile(Str(path).Get()), TOV_OK);
    std::remove(path.c_str());
}

}  // namespace
