// The tree itself: what a DOM hands back, adding and removing children,
// copying, and going back to what the DOM says.
#include <gtest/gtest.h>

#include "XmlFixture.h"
#include "xml/ZEBXmlText.h"

namespace {

using namespace ZEB;
using namespace ZEB::XMLUtils;

class XmlTree : public XmlFixture {};

TEST_F(XmlTree, OnlyWrappedKindsJoinTheTreeAndTheFirstOfTwoAttributesWins) {
    auto doc = Fake(dom.Element("R")
                        ->With(dom.Attribute("id", "first"))
                        ->With(dom.Attribute("id", "second"))
                        ->With(dom.Attribute("ID", "upper"))
                        ->Add(dom.Node(UTIL::kTOVXmlComment, "note"))
                        ->Add(dom.Element("X"))
                        ->Add(dom.Node(UTIL::kTOVXmlProcessingInstruction, "pi"))
                        ->Add(dom.Node(UTIL::kTOVXmlCDATA, "raw"))
                        ->Add(dom.Element("X")->Add(dom.Text("second"))));
    ZEBXmlElement* top = doc->DocumentElement();
    ASSERT_NE(top->GetElement(Z("X"), 1), nullptr);
    EXPECT_EQ(S(top->GetElement(Z("X"), 1)->GetText()), "second");
    EXPECT_EQ(top->GetElement(Z("X"), 2), nullptr);
    std::vector<ZEBXmlNode*> others;
    ASSERT_EQ(top->GetAllNonAttrChildren(others), TOV_OK);
    EXPECT_EQ(others.size(), 3u) << "two elements and the CDATA";
    EXPECT_EQ(dom.Outstanding(), 8) << "R, three attributes, two X, the CDATA and the text";

    EXPECT_EQ(S(top->GetAttribute(Z("id"))), "first");
    EXPECT_EQ(S(top->GetAttribute(Z("ID"))), "upper");
    EXPECT_EQ(ThrownBy([&] { top->GetAttribute(Z("Id")); }), ZEB_E_NOTFOUND);
}

TEST_F(XmlTree, WhatTheDomHandsBackBadlyBecomesAResult) {
    const struct {
        const char* what;
        std::function<void(FakeXmlNode& root, FakeXmlNode& attribute)> fault;
        std::function<TOVRESULT(ZEBXmlElement&)> call;
        TOVRESULT expected;
    } cases[] = {
        {"null attribute list", [](FakeXmlNode& r, FakeXmlNode&) { r.nullAttributeList = true; },
         [](ZEBXmlElement& e) { return e.Load(); }, TOV_E_POINTER},
        {"null child", [](FakeXmlNode& r, FakeXmlNode&) { r.nullChild = true; },
         [](ZEBXmlElement& e) { return e.Load(); }, TOV_E_POINTER},
        {"element view refused", [](FakeXmlNode& r, FakeXmlNode&) { r.queryResult = TOV_E_NOINTERFACE; },
         [](ZEBXmlElement& e) { return ThrownBy([&] { e.GetTagName(); }); }, TOV_E_UNEXPECTED},
        {"element view null", [](FakeXmlNode& r, FakeXmlNode&) { r.nullView = true; },
         [](ZEBXmlElement& e) { return ThrownBy([&] { e.GetTagName(); }); }, TOV_E_POINTER},
        {"attribute view refused", [](FakeXmlNode&, FakeXmlNode& a) { a.queryResult = TOV_E_NOINTERFACE; },
         [](ZEBXmlElement& e) { return e.Load(); }, TOV_E_NOINTERFACE},
        {"attribute view null", [](FakeXmlNode&, FakeXmlNode& a) { a.nullView = true; },
         [](ZEBXmlElement& e) { return e.Load(); }, TOV_E_POINTER},
    };
    for (const auto& c : cases) {
        FakeXmlNode* attribute = dom.Attribute("a", "1");
        FakeXmlNode* root = dom.Element("R")->With(attribute)->Add(dom.Element("X"));
        auto doc = Fake(root);
        c.fault(*root, *attribute);
        EXPECT_EQ(c.call(*doc->DocumentElement()), c.expected) << c.what;
    }
}

TEST_F(XmlTree, AppendLookupAndRemoveWorkByDomNodeAndAChildMadeInMemoryBlocksLookups) {
    FakeXmlNode* a = dom.Element("A");
    FakeXmlNode* b = dom.Element("B");
    auto doc = Fake(dom.Element("R")->Add(a)->Add(b));
    ZEBXmlElement* root = doc->DocumentElement();
    ZEBXmlElement* added = nullptr;
    EXPECT_EQ(root->AddElement(Z("NEW"), &added), ZEB_E_NOTREADY) << "added to an element never fetched";
    EXPECT_EQ(root->CountElement(Z("")), 2u);

    ZEBXmlNode* found = root->Lookup(a->Dom());
    ASSERT_NE(found, nullptr);
    EXPECT_EQ(root->Append(a->Dom()), found) << "a second wrapper was made for a child";
    std::unique_ptr<ZEBXmlNode> twin(ZEBXmlNode::Bind(a->Dom()));
    EXPECT_EQ(root->Append(twin.get()), TOV_E_UNEXPECTED) << "a bound node was added twice";
    FakeXmlNode* out = dom.Element("OUT");
    ZEBXmlNode* outside = root->Append(out->Dom());
    ASSERT_NE(outside, nullptr);
    EXPECT_EQ(outside->Owner(), root);
    EXPECT_EQ(root->CountElement(Z("")), 3u);

    std::unique_ptr<ZEBXmlNode> taken(found);
    ASSERT_EQ(root->Remove(taken.get()), TOV_OK);
    EXPECT_EQ(taken->Owner(), nullptr);
    EXPECT_EQ(root->Remove(a->Dom()), ZEB_E_NOTFOUND);
    EXPECT_EQ(root->Remove(b->Dom()), TOV_OK);
    EXPECT_EQ(b->refs, 1u) << "the removed child was not deleted";
    EXPECT_EQ(root->CountElement(Z("")), 1u);

    ASSERT_EQ(root->AddElement(Z("NEW"), &added), TOV_OK);
    EXPECT_EQ(root->GetElement(Z("NEW"), 0), added);
    EXPECT_EQ(root->Lookup(out->Dom()), outside) << "a match before the child made in memory is found";
    EXPECT_EQ(ThrownBy([&] { root->Lookup(a->Dom()); }), ZEB_E_NOTREADY);
}

TEST_F(XmlTree, ACopyHoldsTheSameDomAndOwnsItsChildren) {
    auto doc = Parse("<R a='1'><X>x</X>t</R>");
    ZEBXmlElement* root = doc->DocumentElement();
    ZEBXmlElement* x = root->GetElement(Z("X"), 0);
    ASSERT_NE(x, nullptr);
    {
        ZEBXmlElement copy(*root);
        EXPECT_EQ(copy.InArg(), root->InArg());
        EXPECT_EQ(S(copy.GetAttribute(Z("a"))), "1");
        EXPECT_EQ(S(copy.GetText()), "t");
        ZEBXmlElement* copiedX = copy.GetElement(Z("X"), 0);
        ASSERT_NE(copiedX, nullptr);
        EXPECT_NE(copiedX, x);
        EXPECT_EQ(copiedX->Owner(), &copy);
        EXPECT_EQ(S(copiedX->GetText()), "x") << "a copy of an element never read cannot read";
    }
    EXPECT_EQ(S(x->GetText()), "x");

    EXPECT_EQ(root->CopyTo(*root), TOV_OK);
    EXPECT_EQ(root->CountElement(Z("X")), 1u) << "copying onto itself lost the children";
    ZEBXmlText notAnElement;
    EXPECT_EQ(root->CopyTo(notAnElement), TOV_E_UNEXPECTED);
    ASSERT_EQ(root->AddElement(Z("NEW"), nullptr), TOV_OK);
    ZEBXmlElement target;
    EXPECT_EQ(root->CopyTo(target), ZEB_E_NOTREADY) << "a child made in memory was copied";
}

TEST_F(XmlTree, DiscardAndReloadGoBackToTheDom) {
    auto doc = Parse("<R a='1'><X/></R>");
    ZEBXmlElement* root = doc->DocumentElement();
    ZEBXmlElement* x = root->GetElement(Z("X"), 0);
    ASSERT_NE(x, nullptr);
    ASSERT_EQ(root->Reload(), TOV_OK);
    EXPECT_EQ(root->GetElement(Z("X"), 0), x) << "an unchanged element was rebuilt";

    const std::function<TOVRESULT(ZEBXmlElement&)> ways[] = {[](ZEBXmlElement& e) { return e.DiscardChanges(); },
                                                             [](ZEBXmlElement& e) { return e.Reload(); }};
    for (const auto& goBack : ways) {
        ASSERT_EQ(root->SetAttribute(Z("b"), Z("2")), TOV_OK);
        ASSERT_EQ(root->AddElement(Z("Y"), nullptr), TOV_OK);
        ASSERT_EQ(root->SetAttribute(Z("a"), Z("9")), TOV_OK);
        ASSERT_EQ(root->GetElement(Z("X"), 0)->Delete(), TOV_OK);
        ASSERT_EQ(goBack(*root), TOV_OK);
        EXPECT_EQ(root->GetStatus(), ZEBXmlNode::kStatusLoaded);
        EXPECT_EQ(S(root->GetAttribute(Z("a"))), "1");
        EXPECT_FALSE(root->HasAttribute(Z("b")));
        EXPECT_EQ(root->CountElement(Z("")), 1u);
        EXPECT_NE(root->GetElement(Z("X"), 0)->GetStatus(), ZEBXmlNode::kStatusDeleted);
        EXPECT_EQ(root->SetAttribute(Z("b"), Z("again")), TOV_OK) << "the index still knew the dropped attribute";
        ASSERT_EQ(root->Reload(), TOV_OK);
    }
}

}  // namespace
