// The host's SAX reader, and what every XML reader of the host refuses.
#include <gtest/gtest.h>

#include <cstdio>
#include <fstream>
#include <string>
#include <vector>

#include "TestHost.h"
#include "XmlTestSupport.h"
#include "tov/ITOVXmlSax.h"

namespace {

using namespace UTIL;

// Records the events as text lines; can be told to fail at a given element.
class RecordingHandler : public ITOVSaxDocumentHandler, public ITOVSaxErrorHandler {
public:
    TOVRESULT QueryInterface(const _tovUID&, void** out) override {
        *out = nullptr;
        return TOV_E_NOINTERFACE;
    }
    uint32_t AddRef() override { return ++refs; }
    uint32_t Release() override { return --refs; }

    TOVRESULT Start() override { return Log("start"); }
    TOVRESULT End() override { return Log("end"); }
    TOVRESULT Element(ITOVString* name) override {
        const std::string text = Utf8(name);
        Log("element " + text);
        return text == failAt ? TOV_E_FAIL : TOV_OK;
    }
    TOVRESULT Attribute(ITOVString* name, ITOVString* value) override {
        return Log("attribute " + Utf8(name) + "=" + Utf8(value));
    }
    TOVRESULT Text(ITOVString* text) override { return Log("text " + Utf8(text)); }
    TOVRESULT Warning(ITOVString* message) override { return Own("warning", message); }
    TOVRESULT Error(ITOVString* message) override { return Own("error", message); }
    TOVRESULT FatalError(ITOVString* message) override { return Own("fatal", message); }

    std::vector<std::string> events, errors;
    std::string failAt;
    uint32_t refs = 1;

private:
    TOVRESULT Log(const std::string& line) {
        events.push_back(line);
        return TOV_OK;
    }
    TOVRESULT Own(const char* kind, ITOVString* message) {
        errors.push_back(std::string(kind) + ": " + Utf8(message));
        message->Release();  // error handlers own their message
        return TOV_OK;
    }
};

// A SAX reader of `host` that reports to `handler`.
TOVPtr<ITOVXmlSaxParser> NewSaxReader(TOVHost* host, RecordingHandler& handler) {
    auto parser = NewComponent<ITOVXmlSaxParser>(host, CompID_TOVXmlSaxReader, IID_ITOVXmlSaxParser);
    EXPECT_EQ(parser->SetDocumentHandler(&handler), TOV_OK);
    EXPECT_EQ(parser->SetErrorHandler(&handler), TOV_OK);
    return parser;
}

class HostXmlSax : public ::testing::Test {
protected:
    void TearDown() override {
        parser.Reset();
        EXPECT_EQ(handler.refs, 1u) << "the parser gave its handler references back";
    }

    TestHost host;
    RecordingHandler handler;
    TOVPtr<ITOVXmlSaxParser> parser = NewSaxReader(host.Get(), handler);
};

TEST_F(HostXmlSax, ReportsElementsAttributesAndTextInOrder) {
    ASSERT_EQ(
        parser->Parse(Str(R"(<SCMain><Audio DropFrameFlag="true">é<![CDATA[x]]></Audio></SCMain>)").Get(), nullptr),
        TOV_OK);
    EXPECT_EQ(handler.events, (std::vector<std::string>{"start", "element SCMain", "element Audio",
                                                        "attribute DropFrameFlag=true", "text é", "text x", "end"}));
    EXPECT_TRUE(handler.errors.empty());
}

TEST_F(HostXmlSax, ParsesAFileWhenNoTextIsGiven) {
    const std::string path = ::testing::TempDir() + "clip.xml";
    std::ofstream(path) << "<SCMain><ClipName>Take 1</ClipName></SCMain>";
    ASSERT_EQ(parser->Parse(nullptr, Str(path).Get()), TOV_OK);
    EXPECT_EQ(handler.events[3], "text Take 1");
    std::remove(path.c_str());
    EXPECT_EQ(parser->Parse(nullptr, Str(path).Get()), TOV_E_FILEOPEN);
    EXPECT_NE(LastError(parser.Get()).find(path), std::string::npos);
}

TEST_F(HostXmlSax, AFailingHandlerOrMalformedTextStopsTheParse) {
    handler.failAt = "Stop";
    EXPECT_EQ(parser->Parse(Str("<A><Stop/><Never/></A>").Get(), nullptr), TOV_E_FAIL);
    EXPECT_EQ(handler.events.back(), "element Stop");

    EXPECT_EQ(parser->Parse(Str("<A><B></A>").Get(), nullptr), TOV_E_FAIL);
    ASSERT_FALSE(handler.errors.empty());
    EXPECT_EQ(handler.errors.back().rfind("fatal: ", 0), 0u) << handler.errors.back();
    EXPECT_FALSE(LastError(parser.Get()).empty());
}

std::string BillionLaughs() {
    std::string text = "<?xml version=\"1.0\"?><!DOCTYPE lolz [<!ENTITY lol \"lol\">";
    for (int i = 1; i <= 9; ++i) {
        text += "<!ENTITY lol" + std::to_string(i) + " \"";
        for (int j = 0; j < 10; ++j) text += "&lol" + (i == 1 ? std::string() : std::to_string(i - 1)) + ";";
        text += "\">";
    }
    return text + "]><lolz a=\"&lol9;\">&lol9;</lolz>";
}

std::string Nested(int depth) {
    std::string text;
    for (int i = 0; i < depth; ++i) text += "<a>";
    for (int i = 0; i < depth; ++i) text += "</a>";
    return text;
}

// Documents that try to make a reader expand, fetch or recurse without bound,
// given to the DOM and the SAX reader alike.
TEST(LibXmlSafety, ReadersRefuseOrReadWithoutExpansion) {
    constexpr const char* kSecret = "TOP-SECRET-CONTENT";
    const std::string secretPath = ::testing::TempDir() + "secret.txt";
    std::ofstream(secretPath) << kSecret;
    const struct {
        const char* name;
        std::string text;
    } attacks[] = {
        {"billion laughs", BillionLaughs()},
        {"external entity",
         "<?xml version=\"1.0\"?><!DOCTYPE r [<!ENTITY s SYSTEM \"file://" + secretPath + "\">]><r>&s;</r>"},
        {"external parameter entity",
         "<?xml version=\"1.0\"?><!DOCTYPE r [<!ENTITY % p SYSTEM \"file://" + secretPath + "\"> %p;]><r/>"},
        {"external subset", "<?xml version=\"1.0\"?><!DOCTYPE r SYSTEM \"file://" + secretPath + "\"><r>x</r>"},
        {"100,000 deep", Nested(100000)},
    };
    TestHost host;
    for (const auto& attack : attacks) {
        SCOPED_TRACE(attack.name);
        // Read, if at all, then without the external subset: only the plain text is there.
        const bool readable = std::string(attack.name) == "external subset";
        TOVPtr<ITOVXmlParser> dom = NewDomReader(host.Get());
        EXPECT_EQ(dom->ParseText(Str(attack.text).Get()), readable ? TOV_OK : TOV_E_FAIL);
        EXPECT_EQ(LastError(dom.Get()).find(kSecret), std::string::npos);
        if (readable) {
            EXPECT_EQ(ValueOf(ChildOf(RootOf(dom.Get()), 0)), "x");
        }

        RecordingHandler handler;
        const TOVRESULT result = NewSaxReader(host.Get(), handler)->Parse(Str(attack.text).Get(), nullptr);
        if (!readable) {
            EXPECT_EQ(result, TOV_E_FAIL);
        }
        handler.events.insert(handler.events.end(), handler.errors.begin(), handler.errors.end());
        for (const std::string& line : handler.events) {
            EXPECT_EQ(line.find(kSecret), std::string::npos) << line;
            EXPECT_EQ(line.find("lollol"), std::string::npos) << "expanded: " << line;
        }
    }
    std::remove(secretPath.c_str());
    EXPECT_EQ(NewDomReader(host.Get())->ParseText(Str(Nested(200)).Get()), TOV_OK) << "nesting within the limit";
}

}  // namespace
