#include "SampleAccessTest.h"

#include "boundary/OrloRegInfo.h"
#include "startup/ZEBUtilLib.h"

void SampleAccessTest::SetUp() {
    ASSERT_EQ(ZEB::ZEBInitialize(host.Get()), TOV_OK);
    startup = std::make_unique<PluginStartup>(host->AsUnknown());
    ASSERT_EQ(startup->Result(), TOV_OK);
    ASSERT_EQ(host->RegisterBuiltin(OrloRegInfo::CompID_OrloReaderMovSampleMapping,
                                    OrloRegInfo::CLSID_OrloReaderMovSampleMapping, L"OrloReaderSampleMapping",
                                    &ZEB::Impl::OrloReaderSampleMapping::TOVCreate),
              TOV_OK);
    host.ClearLines();
}

void SampleAccessTest::TearDown() {
    startup.reset();
    ZEB::ZEBTerminate();
}

ZEB::ZEBString SampleAccessTest::Text(const std::string& text) {
    return ZEB::ZEBString(reinterpret_cast<const unsigned char*>(text.c_str()));
}

TOVPtr<ISampleMapping> SampleAccessTest::NewMap() {
    TOVPtr<ISampleMapping> map;
    EXPECT_EQ(
        host->CreateComponent(OrloRegInfo::CompID_OrloReaderMovSampleMapping, nullptr, IID_ISampleMapping, map.Out()),
        TOV_OK);
    return map;
}

ZEB::Impl::OrloReaderSampleMapping& SampleAccessTest::Concrete(const TOVPtr<ISampleMapping>& map) {
    return dynamic_cast<ZEB::Impl::OrloReaderSampleMapping&>(*map);
}

TOVPtr<ISampleMapping> SampleAccessTest::MapOf(const std::string& path) {
    TOVPtr<ISampleMapping> map = NewMap();
    EXPECT_TRUE(Concrete(map).SetFilePath(Text(path)));
    return map;
}

size_t SampleAccessTest::LinesWith(uint32_t levels, const std::string& text) const {
    size_t count = 0;
    for (const auto& [level, line] : host.Lines())
        if ((level & levels) != 0 && line.find(text) != std::string::npos) ++count;
    return count;
}

uint32_t References(ITOVUnknown* object) {
    object->AddRef();
    return object->Release();
}
