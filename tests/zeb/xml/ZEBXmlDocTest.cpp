// Parsing, starting and writing documents, over the fake DOM and factory.
#include <gtest/gtest.h>

#include "XmlFixture.h"

namespace {

using namespace ZEB;
using namespace ZEB::XMLUtils;

class XmlDocument : public XmlFixture {};

TEST_F(XmlDocument, ChildrenAreFetchedOnFirstNeedAndOnlyOnce) {
    FakeXmlNode* inner = dom.Element("B")->Add(dom.Text("deep"));
    auto doc = Fake(dom.Element("ROOT")->With(dom.Attribute("id", "7"))->Add(dom.Element("A"))->Add(inner));
    ZEBXmlElement* top = doc->DocumentElement();
    ASSERT_NE(top, nullptr);
    EXPECT_EQ(dom.Fetches(), 0) << "parsing fetched children";

    ZEBXmlElement* b = top->GetElement(Z("B"), 0);
    ASSERT_NE(b, nullptr);
    EXPECT_EQ(dom.Fetches(), 3) << "the attribute list and two children of the root";
    EXPECT_EQ(top->Load(), TOV_OK);
    EXPECT_TRUE(top->HasAttribute(Z("id")));
    EXPECT_EQ(top->CountElement(Z("")), 2u);
    EXPECT_EQ(dom.Fetches(), 3) << "a loaded element fetched its children again";
    EXPECT_EQ(S(b->GetText()), "deep");
    EXPECT_EQ(dom.Fetches(), 4) << "only B's own child is fetched; A stays unread";
    EXPECT_EQ(dom.Outstanding(), 5) << "one reference per wrapped node: ROOT, id, A, B and the text";
}

TEST_F(XmlDocument, ParseFailuresLeaveNoRoot) {
    const struct {
        const char* what;
        std::function<void(FakeXmlFactory&, FakeXmlDom&)> setup;
        TOVRESULT expected;
    } cases[] = {
        {"reader not made", [](FakeXmlFactory& f, FakeXmlDom&) { f.createResult = TOV_E_FAIL; }, TOV_E_FAIL},
        {"reader made null", [](FakeXmlFactory& f, FakeXmlDom&) { f.nullComponent = true; }, TOV_E_POINTER},
        {"parse refused", [](FakeXmlFactory& f, FakeXmlDom&) { f.parseResult = TOV_E_FAIL; }, TOV_E_FAIL},
        {"no root", [](FakeXmlFactory& f, FakeXmlDom&) { f.rootResult = ZEB_E_NOTREADY; }, ZEB_E_NOTREADY},
        {"null root", [](FakeXmlFactory& f, FakeXmlDom&) { f.root = nullptr; }, TOV_E_POINTER},
        {"root without node view", [](FakeXmlFactory& f, FakeXmlDom&) { f.root->queryResult = TOV_E_NOINTERFACE; },
         TOV_E_NOINTERFACE},
        {"root is a comment", [](FakeXmlFactory& f, FakeXmlDom& d) { f.root = d.Node(UTIL::kTOVXmlComment, "c"); },
         TOV_E_NOTSUPPORTED},
        {"root is text", [](FakeXmlFactory& f, FakeXmlDom& d) { f.root = d.Text("t"); }, TOV_E_NOTSUPPORTED},
    };
    for (const auto& c : cases) {
        FakeXmlFactory local;
        local.root = dom.Element("ROOT");
        c.setup(local, dom);
        {
            ZEBXmlDoc doc(&local);
            EXPECT_EQ(doc.Load(Z("<x/>")), c.expected) << c.what;
            EXPECT_EQ(doc.DocumentElement(), nullptr) << c.what;
        }
        EXPECT_EQ(local.refs, 1u) << c.what;
    }
    EXPECT_EQ(ZEBXmlDoc(nullptr).Load(Z("<x/>")), ZEB_E_NOTREADY) << "no factory";
}

TEST_F(XmlDocument, ASecondParseReplacesTheTreeOnlyWhenItSucceeds) {
    FakeXmlNode* first = dom.Element("FIRST")->Add(dom.Element("CHILD"));
    factory.root = first;
    ZEBXmlDoc doc(&factory);
    ASSERT_EQ(doc.Load(Z("1")), TOV_OK);
    ASSERT_NE(doc.DocumentElement()->GetElement(Z("CHILD"), 0), nullptr);

    factory.parseResult = TOV_E_FAIL;
    EXPECT_EQ(doc.Load(Z("2")), TOV_E_FAIL);
    EXPECT_EQ(S(doc.DocumentElement()->GetTagName()), "FIRST") << "a failed parse dropped the tree";

    factory.parseResult = TOV_OK;
    factory.root = dom.Element("SECOND");
    EXPECT_EQ(doc.Load(Z("3")), TOV_OK);
    EXPECT_EQ(S(doc.DocumentElement()->GetTagName()), "SECOND");
    EXPECT_EQ(dom.Outstanding(), 1) << "the replaced tree still holds its DOM nodes";
    EXPECT_EQ(factory.refs, 3u) << "the test, the document and one reader";
}

TEST_F(XmlDocument, NewStartsOneRootInMemoryAndEachWriteUsesAFreshWriter) {
    ZEBXmlDoc doc(&factory);
    ZEBString out;
    EXPECT_EQ(doc.WriteTo(out), ZEB_E_NOTREADY) << "a document without a root was written";
    EXPECT_EQ(doc.New(Z("")), TOV_E_INVALIDARG);
    ASSERT_EQ(doc.New(Z("ROOT")), TOV_OK);
    ZEBXmlElement* root = doc.DocumentElement();
    ASSERT_NE(root, nullptr);
    EXPECT_EQ(root->GetStatus(), ZEBXmlNode::kStatusChanged);
    EXPECT_EQ(doc.New(Z("OTHER")), ZEB_E_DOCOPEN);
    EXPECT_EQ(doc.DocumentElement(), root);
    ASSERT_EQ(doc.Save(Z("/tmp/out.xml")), TOV_OK);
    ASSERT_EQ(doc.WriteTo(out), TOV_OK);
    EXPECT_EQ(S(out), "recorded");
    EXPECT_EQ(factory.log, (std::vector<std::string>{"open /tmp/out.xml", "element ROOT", "close", "open <memory>",
                                                     "element ROOT"}));
    EXPECT_EQ(factory.writers, 1) << "the earlier writer was not released";

    factory.createResult = TOV_E_FAIL;
    EXPECT_EQ(doc.Save(Z("/tmp/out.xml")), TOV_E_FAIL);
    factory.createResult = TOV_OK;
    factory.nullComponent = true;
    EXPECT_EQ(doc.WriteTo(out), TOV_E_POINTER);
}

}  // namespace
