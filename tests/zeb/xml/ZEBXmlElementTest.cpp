// Reading and changing elements of documents the host parsed.
#include <gtest/gtest.h>

#include <string>

#include "XmlFixture.h"
#include "tov/sdk/TOVFailureStyle.h"
#include "xml/ZEBXmlAttribute.h"
#include "xml/ZEBXmlText.h"

namespace {

using namespace ZEB;
using namespace ZEB::XMLUtils;

class XmlElement : public XmlFixture {};

const unsigned short* U16(const char16_t* text) { return reinterpret_cast<const unsigned short*>(text); }

TEST_F(XmlElement, TextJoinsTheDirectTextPiecesOnly) {
    const struct {
        const char* xml;
        std::u16string text;
    } cases[] = {
        {"<A>one<B>two</B>three</A>", u"onethree"}, {"<A><![CDATA[raw]]></A>", u""}, {"<A>a<!-- note -->b</A>", u"ab"}};
    for (const auto& c : cases) {
        auto doc = Parse(c.xml);
        const ZEBString text = doc->DocumentElement()->GetText();
        EXPECT_EQ(text.GetUnicodeType(), kTOVUnicodeUTF16) << c.xml;
        EXPECT_EQ(std::u16string(reinterpret_cast<const char16_t*>(text.GetUTF16String())), c.text) << c.xml;
    }
}

TEST_F(XmlElement, TextFollowsChangedAndDeletedPieces) {
    auto doc = Parse("<A>one<B/>two</A>");
    ZEBXmlElement* root = doc->DocumentElement();
    std::vector<ZEBXmlText*> pieces;
    ASSERT_EQ(root->GetAllTexts(pieces), TOV_OK);
    ASSERT_EQ(pieces.size(), 2u);
    ASSERT_EQ(pieces[0]->SetText(Z("ONE")), TOV_OK);
    ASSERT_EQ(pieces[1]->Delete(), TOV_OK);
    ASSERT_EQ(root->AppendText(Z("+")), TOV_OK);
    EXPECT_EQ(S(root->GetText()), "ONE+");
    ASSERT_EQ(root->SetText(Z("new")), TOV_OK);
    EXPECT_EQ(S(root->GetText()), "new");
    ASSERT_EQ(root->GetAllTexts(pieces), TOV_OK);
    EXPECT_EQ(pieces.size(), 2u + 3u) << "bound pieces stay, marked deleted; the one made in memory goes";
}

TEST_F(XmlElement, ChildElementsAreFoundByExactTagPastComments) {
    auto doc = Parse("<R><!--c--><X>1</X><Y>y</Y><X>2</X><x>3</x><\xc3\x9c>4</\xc3\x9c></R>");
    ZEBXmlElement* root = doc->DocumentElement();
    const struct {
        const char* tag;
        unsigned int index;
        const char* text;  // null: no such element
    } cases[] = {
        {"X", 0, "1"}, {"X", 1, "2"},        {"X", 2, nullptr},
        {"x", 0, "3"}, {"\xc3\x9c", 0, "4"}, {"\xc3\xbc", 0, nullptr},
        {"", 1, "y"},  {"", 5, nullptr},
    };
    for (const auto& c : cases) {
        ZEBXmlElement* found = root->GetElement(Z(c.tag), c.index);
        EXPECT_EQ(root->GetElement(std::string_view(c.tag), c.index), found) << "by UTF-8: " << c.tag << c.index;
        if (!c.text) {
            EXPECT_EQ(found, nullptr) << c.tag << c.index;
            continue;
        }
        ASSERT_NE(found, nullptr) << c.tag << c.index;
        EXPECT_EQ(S(found->GetText()), c.text) << c.tag << c.index;
        if (*c.tag) {
            EXPECT_TRUE(found->HasTag(c.tag)) << c.tag;
        }
    }
    EXPECT_FALSE(root->GetElement(std::string_view("Y"), 0)->HasTag("y"));
    EXPECT_EQ(root->CountElement(Z("")), 5u);
    EXPECT_EQ(root->CountElement(Z("X")), 2u);
}

TEST_F(XmlElement, AttributePairsMustAllMatchElementPairsNeedOne) {
    auto doc = Parse("<R><T kind='Mic' n='1'><NAME>Boom</NAME><NAME>Lav</NAME></T><T kind='mic'/><U kind='MIC'/></R>");
    ZEBXmlElement* root = doc->DocumentElement();
    ZEBXmlElement* t = root->GetElement(Z("T"), 0);
    ASSERT_NE(t, nullptr);
    const _ZEBXMLATTRPAIR kindMic{U16(u"kind"), U16(u"Mic")}, kindLower{U16(u"kind"), U16(u"mic")},
        nameUpper{U16(u"KIND"), U16(u"Mic")}, nTwo{U16(u"n"), U16(u"2")};
    const struct {
        std::vector<_ZEBXMLATTRPAIR> pairs;
        int flag, expected;
    } attributeCases[] = {
        {{}, 0, 1}, {{kindLower}, 0, 1}, {{kindLower}, 1, 0}, {{nameUpper}, 0, 0}, {{kindMic, nTwo}, 0, 0},
    };
    for (const auto& c : attributeCases) {
        EXPECT_EQ(t->IsMatched(c.pairs.data(), static_cast<unsigned int>(c.pairs.size()), c.flag), c.expected)
            << c.pairs.size() << " pairs, flag " << c.flag;
    }
    const _ZEBXMLELEMPAIR lav{U16(u"NAME"), U16(u"lav")}, boom{U16(u"NAME"), U16(u"Boom")},
        nope{U16(u"NAME"), U16(u"Nope")};
    const struct {
        std::vector<_ZEBXMLELEMPAIR> pairs;
        int flag, expected;
    } elementCases[] = {
        {{}, 0, 1}, {{lav}, 0, 1}, {{lav}, 1, 0}, {{nope, boom}, 0, 1}, {{nope}, 0, 0},
    };
    for (const auto& c : elementCases) {
        EXPECT_EQ(t->IsMatched(c.pairs.data(), static_cast<unsigned int>(c.pairs.size()), c.flag), c.expected)
            << c.pairs.size() << " pairs, flag " << c.flag;
    }

    EXPECT_EQ(root->GetElement(Z("T"), &kindMic, 1, 1), root->GetElement(Z("T"), 1));
    EXPECT_EQ(root->CountElement(Z(""), &kindMic, 1), 3u);
    EXPECT_EQ(root->CountElement(Z(""), &boom, 1), 1u);
    unsigned int deleted = 0;
    ASSERT_EQ(root->DeleteElements(Z("T"), &kindMic, 1, deleted), TOV_OK);
    EXPECT_EQ(deleted, 2u);
}

TEST_F(XmlElement, SettingABoundAttributeKeepsItsName) {
    auto doc = Parse("<R a='1' b='2'/>");
    ZEBXmlElement* root = doc->DocumentElement();
    ASSERT_EQ(root->Load(), TOV_OK);
    ASSERT_EQ(root->SetAttribute(Z("b"), Z("20")), TOV_OK);
    EXPECT_EQ(S(root->GetAttribute(Z("b"))), "20");
    EXPECT_EQ(S(root->GetAttributeNode(Z("b"))->GetName()), "b");

    ASSERT_EQ(root->SetAttribute(Z("c"), Z("3")), TOV_OK);
    ZEBXmlAttribute* c = root->GetAttributeNode(Z("c"));
    ASSERT_NE(c, nullptr);
    ASSERT_EQ(c->SetName(Z("d")), TOV_OK);
    EXPECT_FALSE(root->HasAttribute(Z("c")));
    EXPECT_EQ(root->GetAttributeNode(Z("d")), c);

    ASSERT_EQ(root->DeleteAttribute(Z("a")), TOV_OK);
    EXPECT_FALSE(root->HasAttribute(Z("a")));
    EXPECT_EQ(root->DeleteAttribute(Z("none")), TOV_OK);
}

TEST_F(XmlElement, ChangesThatAreRefused) {
    const struct {
        const char *what, *xml;
        std::function<TOVRESULT(ZEBXmlElement&)> call;
        TOVRESULT expected;
    } cases[] = {
        {"attribute set before any load", "<R a='1'/>", [](ZEBXmlElement& r) { return r.SetAttribute(Z("a"), Z("2")); },
         ZEB_E_NOTREADY},
        {"bound attribute renamed", "<R a='1'/>",
         [](ZEBXmlElement& r) { return r.GetAttributeNode(Z("a"))->SetName(Z("b")); }, TOV_E_UNEXPECTED},
        {"new attribute given a taken name", "<R a='1'/>",
         [](ZEBXmlElement& r) {
             TOVCheck(r.Load());
             TOVCheck(r.SetAttribute(Z("b"), Z("2")));
             return r.GetAttributeNode(Z("b"))->SetName(Z("a"));
         },
         TOV_E_INVALIDARG},
        {"bound element renamed", "<R/>", [](ZEBXmlElement& r) { return r.SetTagName(Z("S")); }, TOV_E_UNEXPECTED},
        {"attribute deleted where there are none", "<R/>",
         [](ZEBXmlElement& r) {
             TOVCheck(r.Load());
             return r.DeleteAttribute(Z("a"));
         },
         ZEB_E_NOTFOUND},
    };
    for (const auto& c : cases) {
        auto doc = Parse(c.xml);
        EXPECT_EQ(TOVGuarded([&] { return c.call(*doc->DocumentElement()); }), c.expected) << c.what;
    }
}

}  // namespace
