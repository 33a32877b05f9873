// The host's factory, registry and definitions.
#include <gtest/gtest.h>

#include <cwchar>

#include "TestHost.h"
#include "tov/ITOVString.h"

namespace {

constexpr _tovUID kUnknownID = {0x12345678, 0x1234, 0x1234, {1, 2, 3, 4, 5, 6, 7, 8}};

class HostFactory : public ::testing::Test {
protected:
    TestHost host;
};
using DefinitionAttributes = HostFactory;
using ComponentDefinition = HostFactory;

TEST_F(HostFactory, MakesTheStringComponentByItsIdentifierAndThroughItsDefinition) {
    TOVPtr<ITOVString> text;
    ASSERT_EQ(host->CreateComponent(TOVCompID_TOVString, nullptr, IID_ITOVString, text.Out()), TOV_OK);
    const unsigned char hello[] = "hello";
    EXPECT_EQ(text->Assign(kTOVUnicodeUTF8, hello, sizeof hello), TOV_OK);
    EXPECT_EQ(text->GetNumCharacters(), 5u);

    // The route that library start-up takes: definition, class id, class factory.
    TOVPtr<ITOVComponentDefinition> definition;
    ASSERT_EQ(host->GetComponentDefinition(TOVCompID_TOVString, IID_ITOVComponentDefinition, definition.Out()), TOV_OK);
    _tovUID clsid{};
    ASSERT_EQ(definition->GetAttribute(TOVATTR_Component_CLSID, TOVTypeID_UID, &clsid, sizeof clsid), TOV_OK);
    TOVPtr<ITOVClassFactory> factory;
    ASSERT_EQ(host->GetClassFactory(clsid, IID_ITOVClassFactory, factory.Out()), TOV_OK);
    EXPECT_EQ(factory->CreateInstance(host->AsUnknown(), nullptr, IID_ITOVString, text.Out()), TOV_OK);
    EXPECT_TRUE(text);
}

TEST_F(HostFactory, AnswersItsThreeServicesAndRefusesWhatItDoesNotKnow) {
    for (const _tovUID& iid : {IID_ITOVComponentFactory, IID_ITOVConsole, IID_ITOVDefinition, IID_ITOVUnknown}) {
        TOVPtr<ITOVUnknown> service;
        EXPECT_EQ(host->QueryInterface(iid, service.Out()), TOV_OK);
        EXPECT_TRUE(service);
    }
    void* out = reinterpret_cast<void*>(0x1);
    EXPECT_EQ(host->CreateComponent(kUnknownID, nullptr, IID_ITOVUnknown, &out), ZEB_E_NOTFOUND);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(host->GetClassFactory(kUnknownID, IID_ITOVClassFactory, &out), CLASS_E_CLASSNOTAVAILABLE);
    EXPECT_EQ(host->GetComponentDefinition(kUnknownID, IID_ITOVComponentDefinition, &out), ZEB_E_NOTFOUND);
    EXPECT_EQ(host->CreateComponent(TOVCompID_TOVString, nullptr, IID_ITOVString, nullptr), TOV_E_INVALIDARG);
    EXPECT_EQ(host->CreateComponent(TOVCompID_TOVString, nullptr, kUnknownID, &out), TOV_E_NOINTERFACE);
    EXPECT_EQ(host->RegisterBuiltin(TOVCompID_TOVString, kUnknownID, L"again",
                                    [](ITOVUnknown*, ITOVUnknown*, const _tovUID&, void**) { return TOV_E_FAIL; }),
              ZEB_E_ALREADYSET);
}

TEST_F(DefinitionAttributes, AreTypedAndSized) {
    TOVPtr<ITOVPluginDefinition> definition;
    ASSERT_EQ(host->CreateComponent(TOVCompID_PluginDefinition, nullptr, IID_ITOVPluginDefinition, definition.Out()),
              TOV_OK);
    const uint32_t build = 10178;
    ASSERT_EQ(definition->SetAttribute(TOVATTR_Definition_BuildVersion, TOVTypeID_UInt32, &build, 4), TOV_OK);
    const struct {
        const char* name;
        _tovUID askedType;
        unsigned int size;
        TOVRESULT expected;
    } cases[] = {
        {"exact", TOVTypeID_UInt32, 4, TOV_OK},
        {"larger buffer", TOVTypeID_UInt32, 8, TOV_OK},
        {"other type", TOVTypeID_UID, 4, TOV_E_INVALIDARG},
        {"short buffer", TOVTypeID_UInt32, 2, TOV_E_INVALIDARG},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.name);
        uint32_t value[2] = {0, 0};
        EXPECT_EQ(definition->GetAttribute(TOVATTR_Definition_BuildVersion, c.askedType, value, c.size), c.expected);
        if (c.expected == TOV_OK) {
            EXPECT_EQ(value[0], build);
        }
    }
    uint32_t value = 0;
    EXPECT_EQ(definition->GetAttribute(TOVATTR_Definition_PatchVersion, TOVTypeID_UInt32, &value, 4), ZEB_E_NOTFOUND);

    // A Unicode text of unknown size is measured, terminator included.
    const wchar_t description[] = L"Orlo * Media Stream Plug-in (MSP)";
    ASSERT_EQ(definition->SetAttribute(TOVATTR_Definition_Description, TOVTypeID_UnicodeString, description, -1),
              TOV_OK);
    wchar_t out[64];
    std::wmemset(out, L'x', 64);
    ASSERT_EQ(definition->GetAttribute(TOVATTR_Definition_Description, TOVTypeID_UnicodeString, out, sizeof out),
              TOV_OK);
    EXPECT_STREQ(out, description);
    EXPECT_EQ(definition->SetAttribute(TOVATTR_Definition_Description, TOVTypeID_UInt32, nullptr, 4), TOV_E_INVALIDARG);
    EXPECT_EQ(definition->SetAttribute(TOVATTR_Definition_Description, TOVTypeID_UInt32, &out, -1), TOV_E_INVALIDARG);
}

TEST_F(ComponentDefinition, InitializeSetsTheClassAttribute) {
    TOVPtr<ITOVComponentDefinition> definition;
    ASSERT_EQ(
        host->CreateComponent(TOVCompID_ComponentDefinition, nullptr, IID_ITOVComponentDefinition, definition.Out()),
        TOV_OK);
    ASSERT_EQ(definition->Initialize(kUnknownID, TOVCompType_OrrinMediaAccess, 1, 9, IID_ITOVString, L"Name"), TOV_OK);
    _tovUID clsid{};
    ASSERT_EQ(definition->GetAttribute(TOVATTR_Component_CLSID, TOVTypeID_UID, &clsid, sizeof clsid), TOV_OK);
    EXPECT_EQ(clsid, IID_ITOVString);
    EXPECT_STREQ(definition->GetName(), L"Name");
    EXPECT_EQ(definition->Initialize(kUnknownID, kUnknownID, 1, 9, kUnknownID, nullptr), TOV_E_INVALIDARG);
}

}  // namespace
