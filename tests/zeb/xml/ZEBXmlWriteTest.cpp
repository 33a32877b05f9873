// Writing trees out: the calls a writer receives, and round trips through the
// host's writer and reader.
#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>
#include <string>

#include "RecordingXmlWriter.h"
#include "XmlFixture.h"
#include "tov/sdk/TOVFailureStyle.h"
#include "tov/sdk/TOVPtr.h"
#include "xml/ZEBXmlAttribute.h"
#include "xml/ZEBXmlCDATA.h"
#include "xml/ZEBXmlText.h"

namespace {

using namespace ZEB;
using namespace ZEB::XMLUtils;

class XmlWrite : public XmlFixture {
protected:
    std::vector<std::string> log;
    TOVPtr<RecordingXmlWriter> writer{new RecordingXmlWriter(log)};
};

TEST_F(XmlWrite, ElementsComeBeforeTheirAttributesAndChildrenAndCDATAIsLost) {
    auto doc = Parse("<R a='1'>t<C x='2'>u</C><![CDATA[z]]><!--c--><D/></R>");
    ASSERT_EQ(doc->DocumentElement()->Save(writer.Get()), TOV_OK);
    EXPECT_EQ(log, (std::vector<std::string>{"element R", "attribute a=1 on R", "text t on R", "element C in R",
                                             "attribute x=2 on C", "text u on C", "element D in R"}));
}

TEST_F(XmlWrite, ChangesAreWrittenAndDeletedElementsLeftOut) {
    auto doc = Parse("<R a='1'><D/>old</R>");
    ZEBXmlElement* root = doc->DocumentElement();
    ASSERT_EQ(root->Load(), TOV_OK);
    ASSERT_EQ(root->SetAttribute(Z("a"), Z("9")), TOV_OK);
    ASSERT_EQ(root->SetAttribute(Z("b"), Z("2")), TOV_OK);
    ASSERT_EQ(root->AddElement(Z("D"), nullptr), TOV_OK);
    unsigned int untouched = 77;
    ASSERT_EQ(root->DeleteElements(Z("D"), untouched), TOV_OK);
    EXPECT_EQ(untouched, 77u) << "this form leaves its counter alone";
    EXPECT_EQ(root->CountElement(Z("D")), 1u) << "the bound D is marked, the new one gone";
    ASSERT_EQ(root->SetText(Z("new")), TOV_OK);
    ASSERT_EQ(root->AddElement(Z("N"), Z("n"), nullptr), TOV_OK);
    ASSERT_EQ(root->Save(writer.Get()), TOV_OK);
    EXPECT_EQ(log, (std::vector<std::string>{"element R", "attribute a=9 on R", "attribute b=2 on R", "text  on R",
                                             "text new on R", "element N in R", "text n on N"}));
}

TEST_F(XmlWrite, SavesThatAreRefused) {
    ZEBXmlAttribute loneAttribute(Z("n"), Z("v"));
    ZEBXmlText loneText(Z("t"));
    ZEBXmlCDATA section;
    auto doc = Parse("<R a='1'/>");
    ZEBXmlElement* root = doc->DocumentElement();
    const struct {
        const char* what;
        std::function<TOVRESULT(UTIL::ITOVXmlWriter*)> save;
        bool withWriter;
        TOVRESULT expected;
    } cases[] = {
        {"element, no writer", [&](UTIL::ITOVXmlWriter* w) { return root->Save(w); }, false, TOV_E_INVALIDARG},
        {"text, no writer", [&](UTIL::ITOVXmlWriter* w) { return loneText.Save(w); }, false, TOV_E_INVALIDARG},
        {"CDATA, no writer", [&](UTIL::ITOVXmlWriter* w) { return section.Save(w); }, false, TOV_E_INVALIDARG},
        {"CDATA", [&](UTIL::ITOVXmlWriter* w) { return section.Save(w); }, true, TOV_OK},
        {"attribute without element", [&](UTIL::ITOVXmlWriter* w) { return loneAttribute.Save(w); }, true,
         ZEB_E_NOTREADY},
        {"text without element", [&](UTIL::ITOVXmlWriter* w) { return loneText.Save(w); }, true, ZEB_E_NOTREADY},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(c.save(c.withWriter ? writer.Get() : nullptr), c.expected) << c.what;
        EXPECT_TRUE(log.empty()) << c.what;
    }
    // A deleted attribute has no name to write, which ends the save.
    ASSERT_EQ(root->Load(), TOV_OK);
    ASSERT_EQ(root->DeleteAttribute(Z("a")), TOV_OK);
    EXPECT_EQ(root->Save(writer.Get()), ZEB_E_NOTFOUND);
}

TEST_F(XmlWrite, TreesRoundTripThroughTheHostAsTextAndAsAFile) {
    ZEBXmlDoc made(host.Get());
    ASSERT_EQ(made.New(Z("BWFXML")), TOV_OK);
    ZEBXmlElement* take = nullptr;
    ASSERT_EQ(made.DocumentElement()->AddElement(Z("TAKE"), Z("12"), &take), TOV_OK);
    ASSERT_EQ(take->SetAttribute(Z("circled"), Z("TRUE")), TOV_OK);
    ZEBString text;
    ASSERT_EQ(made.WriteTo(text), TOV_OK);
    EXPECT_NE(S(text).find("<TAKE circled=\"TRUE\">12</TAKE>"), std::string::npos) << S(text);

    const std::string path =
        (std::filesystem::temp_directory_path() / ("zeb_xml_" + std::to_string(getpid()) + ".xml")).string();
    ASSERT_EQ(made.Save(Z(path)), TOV_OK);
    ZEBXmlDoc reopened(host.Get());
    ASSERT_EQ(reopened.Open(Z(path)), TOV_OK);
    std::filesystem::remove(path);
    ZEBXmlElement* readTake = reopened.DocumentElement()->GetElement(Z("TAKE"), 0);
    ASSERT_NE(readTake, nullptr);
    EXPECT_EQ(S(readTake->GetAttribute(Z("circled"))), "TRUE");
    EXPECT_EQ(S(readTake->GetText()), "12");
    EXPECT_EQ(ZEBXmlDoc(host.Get()).Open(Z(path)), TOV_E_FILEOPEN);
}

}  // namespace
