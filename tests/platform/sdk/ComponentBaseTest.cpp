// Reference counting, aggregation, creation and the count of live objects.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tov/sdk/CTOVClassFactory.h"
#include "tov/sdk/TOVComponent.h"
#include "tov/sdk/TOVPtr.h"

namespace {

constexpr _tovUID IID_ITestWidget = {0x5B893D25, 0xF848, 0x4D7B, {0x8D, 0x87, 0x3D, 0x8D, 0x29, 0x61, 0xF3, 0xDD}};
constexpr _tovUID IID_IUnrelated = {0x0856AEA6, 0xAE11, 0x46D9, {0xBC, 0x6B, 0xF7, 0xE8, 0x2F, 0xC8, 0x71, 0xEC}};

class ITestWidget : public ITOVUnknown {
public:
    virtual int Value() = 0;

protected:
    ~ITestWidget() = default;
};

// What the widgets did, in order, so tests can check the sequence of teardown.
std::vector<std::string> g_events;
TOVRESULT g_initResult = TOV_OK;
ITOVUnknown* g_lastHost = nullptr;
const std::vector<std::string> kReleased = {"FinalRelease", "destructor"};

class TestWidget : public ITestWidget, public CTOVUnknown {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
        return TOVCreateComponent<TestWidget>(host, outer, iid, out);
    }
    explicit TestWidget(ITOVUnknown* outer) : CTOVUnknown(outer) {}
    ~TestWidget() override { g_events.push_back("destructor"); }

    TOV_FORWARD_UNKNOWN
    int Value() override { return 42; }

    TOVRESULT InitializeInstance(ITOVUnknown* host) override {
        g_lastHost = host;
        return g_initResult;
    }
    void FinalRelease() override { g_events.push_back("FinalRelease"); }
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override {
        return TOVGuarded([&] {
            if (iid == IID_ITestWidget) return TOVExpose<ITestWidget>(this, out);
            return CTOVUnknown::InternalQueryInterface(iid, out);
        });
    }
};

// An outer object that counts on its own and hands ITOVUnknown queries to nobody.
class CountingOuter : public ITOVUnknown {
public:
    TOVRESULT QueryInterface(const _tovUID&, void** out) override {
        *out = nullptr;
        return TOV_E_NOINTERFACE;
    }
    uint32_t AddRef() override { return ++count; }
    uint32_t Release() override { return --count; }
    uint32_t count = 1;
};

// Every case must leave as many live objects as it found.
class ComponentFixture : public ::testing::Test {
protected:
    void SetUp() override {
        g_events.clear();
        g_initResult = TOV_OK;
        g_lastHost = nullptr;
        m_StartObjects = CTOVUnknown::GetActiveObjectCount();
    }
    void TearDown() override { EXPECT_EQ(CTOVUnknown::GetActiveObjectCount(), m_StartObjects); }

    int32_t m_StartObjects = 0;
    CountingOuter m_Host;
};

using ClassFactory = ComponentFixture;
using ComponentCreation = ComponentFixture;

TEST_F(ClassFactory, CreateHandsOutTheOnlyReferenceOrNothing) {
    void* out = reinterpret_cast<void*>(0x1);
    EXPECT_EQ(CTOVClassFactory::Create(TestWidget::TOVCreate, IID_IUnrelated, &out), TOV_E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(CTOVClassFactory::Create(nullptr, IID_ITOVClassFactory, &out), TOV_E_INVALIDARG);
    EXPECT_EQ(CTOVClassFactory::Create(TestWidget::TOVCreate, IID_ITOVClassFactory, nullptr), TOV_E_INVALIDARG);

    TOVPtr<ITOVClassFactory> factory;
    ASSERT_EQ(CTOVClassFactory::Create(TestWidget::TOVCreate, IID_ITOVClassFactory, factory.Out()), TOV_OK);
    EXPECT_EQ(factory->AddRef(), 2u);
    EXPECT_EQ(factory->Release(), 1u);
}

TEST_F(ClassFactory, CreateInstanceChecksArgumentsAndRefusesAggregationButForUnknown) {
    TOVPtr<ITOVClassFactory> factory;
    ASSERT_EQ(CTOVClassFactory::Create(TestWidget::TOVCreate, IID_ITOVClassFactory, factory.Out()), TOV_OK);
    void* out = reinterpret_cast<void*>(0x1);
    EXPECT_EQ(factory->CreateInstance(nullptr, nullptr, IID_ITestWidget, &out), TOV_E_INVALIDARG);
    EXPECT_EQ(factory->CreateInstance(&m_Host, nullptr, IID_ITestWidget, nullptr), TOV_E_INVALIDARG);
    EXPECT_EQ(CTOVClassFactory(nullptr, nullptr).CreateInstance(&m_Host, nullptr, IID_ITestWidget, &out),
              TOV_E_UNEXPECTED);

    CountingOuter outer;
    EXPECT_EQ(factory->CreateInstance(&m_Host, &outer, IID_ITOVClassFactory, &out), CLASS_E_NOAGGREGATION);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(g_lastHost, nullptr) << "the creator must not run";
    EXPECT_EQ(factory->CreateInstance(&m_Host, &outer, IID_ITOVUnknown, &out), TOV_OK);
    EXPECT_EQ(g_lastHost, &m_Host);
    static_cast<ITOVUnknown*>(out)->Release();
}

TEST_F(ComponentCreation, FreeStandingIdentityIsThePrivateUnknown) {
    TOVPtr<ITestWidget> widget;
    ASSERT_EQ(TestWidget::TOVCreate(&m_Host, nullptr, IID_ITestWidget, widget.Out()), TOV_OK);
    EXPECT_EQ(CTOVUnknown::GetActiveObjectCount(), m_StartObjects + 1);
    EXPECT_EQ(widget->Value(), 42);
    ITOVUnknown* identity = nullptr;
    ASSERT_EQ(widget->QueryInterface(IID_ITOVUnknown, reinterpret_cast<void**>(&identity)), TOV_OK);
    EXPECT_NE(static_cast<void*>(identity), static_cast<void*>(widget.Get()));
    // Both references count on the same object.
    EXPECT_EQ(widget->AddRef(), 3u);
    EXPECT_EQ(identity->Release(), 2u);
    EXPECT_EQ(widget->Release(), 1u);
    // A pointer used as an out parameter releases what it held: the last reference here.
    ASSERT_EQ(TestWidget::TOVCreate(&m_Host, nullptr, IID_ITestWidget, widget.Out()), TOV_OK);
    EXPECT_EQ(g_events, kReleased);
}

TEST_F(ComponentCreation, AggregatedPublicPartCountsOnTheOuter) {
    CountingOuter outer;
    ITOVUnknown* inner = nullptr;
    ASSERT_EQ(TestWidget::TOVCreate(&m_Host, &outer, IID_ITOVUnknown, reinterpret_cast<void**>(&inner)), TOV_OK);
    ITestWidget* publicPart = nullptr;
    ASSERT_EQ(inner->QueryInterface(IID_ITestWidget, reinterpret_cast<void**>(&publicPart)), TOV_OK);
    EXPECT_EQ(outer.count, 2u) << "the query's AddRef lands on the outer";
    publicPart->AddRef();
    EXPECT_EQ(outer.count, 3u);
    publicPart->Release();
    publicPart->Release();
    EXPECT_EQ(outer.count, 1u);
    EXPECT_TRUE(g_events.empty());
    inner->Release();  // the inner's own count reaches zero
    EXPECT_EQ(g_events, kReleased);
}

TEST_F(ComponentCreation, FailuresLeaveNothingBehind) {
    void* out = reinterpret_cast<void*>(0x1);
    EXPECT_EQ(TestWidget::TOVCreate(&m_Host, nullptr, IID_IUnrelated, &out), TOV_E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(g_events, kReleased);

    g_events.clear();
    g_initResult = TOV_E_POINTER;
    out = reinterpret_cast<void*>(0x1);
    EXPECT_EQ(TestWidget::TOVCreate(&m_Host, nullptr, IID_ITestWidget, &out), TOV_E_POINTER);
    EXPECT_EQ(out, nullptr);
    // Destroyed directly, not through the release path.
    EXPECT_EQ(g_events, std::vector<std::string>{"destructor"});
}

TEST(TOVPtr, ReadingAnEmptyPointerThrowsThePointerCode) {
    TOVPtr<ITestWidget> empty;
    EXPECT_FALSE(empty);
    EXPECT_EQ(TOVGuarded([&] { return static_cast<TOVRESULT>(empty->Value()); }), TOV_E_POINTER);
    EXPECT_EQ(TOVGuarded([&] { return static_cast<TOVRESULT>((*empty).Value()); }), TOV_E_POINTER);
}

}  // namespace
