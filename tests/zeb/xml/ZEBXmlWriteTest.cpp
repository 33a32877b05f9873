// Writing trees out: the calls a writer receives, and round trips through the
// host's writer and reader.
#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>
#include <string>

#include "RecordingXmlWriter.h"
#include "XmlFixture.h"
#include "tov/sdk/TOVPtr.h"
#include "xml/ZEBXmlAttribute.h"
#include "xml/ZEBXmlCDATA.h"
#include "xml/ZEBXmlText.h"

namespace {

using namespace ZEB;
using namespace ZEB::XMLUtils;

class XmlWrite : public XmlFixture {
protected:
    TOVRESULT SaveRoot(ZEBXmlDoc& doc) { return doc.DocumentElement()->Save(writer.Get()); }

    std::vector<std::string> log;
    TOVPtr<RecordingXmlWriter> writer{new RecordingXmlWriter(log)};
};

TEST_F(XmlWrite, ElementsComeBeforeTheirAttributesAndChildrenAndCDATAIsLost) {
    auto doc = Parse("<R a='1'>t<C x='2'>u</C><![CDATA[z]]><!--c--><D/></R>");
    ASSERT_EQ(SaveRoot(*doc), TOV_OK);
    EXPECT_EQ(log, (std::vector<std::string>{"element R", "attribute a=1 on R", "text t on R", "element C in R",
                                             "attribute x=2 on C", "text u on C", "element D in R"}));
}

TEST_F(XmlWrite, ChangesAreWrittenAndDeletedElementsLeftOut) {
    auto doc = Parse("<R a='1'><D/>old</R>");
    ZEBXmlElement* root = doc->DocumentElement();
    unsigned int unused = 0;
    ASSERT_EQ(root->Load(), TOV_OK);
    ASSERT_EQ(root->SetAttribute(Z("a"), Z("9")), TOV_OK);
    ASSERT_EQ(root->SetAttribute(Z("b"), Z("2")), TOV_OK);
    ASSERT_EQ(root->DeleteElements(Z("D"), unused), TOV_OK);
    ASSERT_EQ(root->SetText(Z("new")), TOV_OK);
    ASSERT_EQ(root->AddElement(Z("N"), Z("n"), nullptr), TOV_OK);
    ASSERT_EQ(SaveRoot(*doc), TOV_OK);
    EXPECT_EQ(log, (std::vector<std::string>{"element R", "attribute a=9 on R", "attribute b=2 on R", "text  on R",
                                             "text new on R", "element N in R", "text n on N"}));
}

TEST_F(XmlWrite, SavesThatAreRefused) {
    ZEBXmlAttribute loneAttribute(Z("n"), Z("v"));
    ZEBXmlText loneText(Z("t"));
    ZEBXmlCDATA section;
    auto doc = Parse("<R a='1'/>");
    const struct {
        const char* what;
        std::function<TOVRESULT(UTIL::ITOVXmlWriter*)> save;
        bool withWriter;
        TOVRESULT expected;
    } cases[] = {
        {"element, no writer", [&](UTIL::ITOVXmlWriter* w) { return doc->DocumentElement()->Save(w); }, false,
         TOV_E_INVALIDARG},
        {"text, no writer", [&](UTIL::ITOVXmlWriter* w) { return loneText.Save(w); }, false, TOV_E_INVALIDARG},
        {"CDATA, no writer", [&](UTIL::ITOVXmlWriter* w) { return section.Save(w); }, false, TOV_E_INVALIDARG},
        {"CDATA", [&](UTIL::ITOVXmlWriter* w) { return section.Save(w); }, true, TOV_OK},
        {"attribute without element", [&](UTIL::ITOVXmlWriter* w) { return loneAttribute.Save(w); }, true,
         ZEB_E_NOTREADY},
        {"text without element", [&](UTIL::ITOVXmlWriter* w) { return loneText.Save(w); }, true, ZEB_E_NOTREADY},
        {"deleted attribute",
         [&](UTIL::ITOVXmlWriter* w) {
             TOVCheck(doc->DocumentElement()->Load());
             TOVCheck(doc->DocumentElement()->DeleteAttribute(Z("a")));
             return doc->DocumentElement()->Save(w);
         },
         true, ZEB_E_NOTFOUND},
    };
    for (const auto& c : cases) {
        log.clear();
        EXPECT_EQ(TOVGuarded([&] { return c.save(c.withWriter ? writer.Get() : nullptr); }), c.expected) << c.what;
        if (c.expected != ZEB_E_NOTFOUND) {
            EXPECT_TRUE(log.empty()) << c.what;
        }
    }
}

TEST_F(XmlWrite, ATreeMadeInMemoryRoundTripsThroughTheHost) {
    ZEBXmlDoc made(host.Get());
    ASSERT_EQ(made.New(Z("BWFXML")), TOV_OK);
    ZEBXmlElement* take = nullptr;
    ASSERT_EQ(made.DocumentElement()->AddElement(Z("TAKE"), Z("12"), &take), TOV_OK);
    ASSERT_EQ(take->SetAttribute(Z("circled"), Z("TRUE")), TOV_OK);
    ASSERT_EQ(made.DocumentElement()->AddElement(Z("NOTE"), Z("caf\xc3\xa9 <1>"), nullptr), TOV_OK);
    ZEBString text;
    ASSERT_EQ(made.WriteTo(text), TOV_OK);
    EXPECT_NE(S(text).find("<TAKE circled=\"TRUE\">12</TAKE>"), std::string::npos) << S(text);

    auto read = Parse(S(text));
    ZEBXmlElement* readTake = read->DocumentElement()->GetElement(Z("TAKE"), 0);
    ASSERT_NE(readTake, nullptr);
    EXPECT_EQ(S(readTake->GetAttribute(Z("circled"))), "TRUE");
    EXPECT_EQ(S(readTake->GetText()), "12");
    EXPECT_EQ(S(read->DocumentElement()->GetElement(Z("NOTE"), 0)->GetText()), "caf\xc3\xa9 <1>");
}

TEST_F(XmlWrite, ADocumentSavedToAFileOpensAgainWithoutItsCDATA) {
    const std::string path =
        (std::filesystem::temp_directory_path() / ("zeb_xml_" + std::to_string(getpid()) + ".xml")).string();
    {
        auto doc = Parse("<R><S>1</S><![CDATA[gone]]></R>");
        ASSERT_EQ(doc->Save(Z(path)), TOV_OK);
    }
    ZEBXmlDoc reopened(host.Get());
    ASSERT_EQ(reopened.Open(Z(path)), TOV_OK);
    std::filesystem::remove(path);
    ZEBXmlElement* root = reopened.DocumentElement();
    EXPECT_EQ(S(root->GetElement(Z("S"), 0)->GetText()), "1");
    std::vector<ZEBXmlCDATA*> sections;
    ASSERT_EQ(root->GetAllCDATAs(sections), TOV_OK);
    EXPECT_TRUE(sections.empty());

    ZEBXmlDoc missing(host.Get());
    EXPECT_EQ(missing.Open(Z(path)), TOV_E_FILEOPEN);
    EXPECT_EQ(missing.DocumentElement(), nullptr);
}

}  // namespace
