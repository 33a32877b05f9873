#pragma once
/// The utility library started on a reference host, with a fake DOM and a
/// fake factory beside it. Every test must give back every host object and
/// every reference to a fake node it was handed.
#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <string>

#include "FakeXmlDom.h"
#include "FakeXmlFactory.h"
#include "TestHost.h"
#include "startup/ZEBUtilLib.h"
#include "tov/sdk/CTOVUnknown.h"
#include "xml/ZEBXmlDoc.h"

inline ZEB::ZEBString Z(const std::string& utf8) {
    return ZEB::ZEBString(reinterpret_cast<const unsigned char*>(utf8.c_str()));
}

inline std::string S(const ZEB::ZEBString& s) { return reinterpret_cast<const char*>(s.GetUTF8String()); }

/// What `call` threw as a result, or TOV_OK when it threw nothing.
inline TOVRESULT ThrownBy(const std::function<void()>& call) {
    try {
        call();
    } catch (int result) {
        return result;
    }
    return TOV_OK;
}

class XmlFixture : public ::testing::Test {
protected:
    void SetUp() override {
        ASSERT_EQ(ZEB::ZEBInitialize(host.Get()), TOV_OK);
        m_StartObjects = CTOVUnknown::GetActiveObjectCount();
    }
    void TearDown() override {
        EXPECT_EQ(dom.Outstanding(), 0) << "a reference to a DOM node was not given back";
        EXPECT_EQ(factory.refs, 1u) << "a reference to the factory or its reader was not given back";
        EXPECT_EQ(factory.writers, 0) << "a writer was not released";
        EXPECT_EQ(CTOVUnknown::GetActiveObjectCount(), m_StartObjects) << "a host object was leaked";
        ZEB::ZEBTerminate();
    }

    /// A document the host parsed from `text`.
    std::unique_ptr<ZEB::XMLUtils::ZEBXmlDoc> Parse(const std::string& text) {
        auto doc = std::make_unique<ZEB::XMLUtils::ZEBXmlDoc>(host.Get());
        EXPECT_EQ(doc->Load(Z(text)), TOV_OK) << text;
        return doc;
    }
    /// A document over the fake DOM whose root is `root`.
    std::unique_ptr<ZEB::XMLUtils::ZEBXmlDoc> Fake(FakeXmlNode* root) {
        factory.root = root;
        auto doc = std::make_unique<ZEB::XMLUtils::ZEBXmlDoc>(&factory);
        EXPECT_EQ(doc->Load(Z("<fake/>")), TOV_OK);
        return doc;
    }

    TestHost host;
    FakeXmlDom dom;
    FakeXmlFactory factory;

private:
    int32_t m_StartObjects = 0;
};
