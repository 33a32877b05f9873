#pragma once
/// A fixture that starts the plug-in on a test host as the module does, with
/// the sample map registered, so that maps are made through the host's
/// factory and console lines can be read.
#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "TestHost.h"
#include "boundary/OrloRegInfo.h"
#include "boundary/PluginStartup.h"
#include "sampleaccess/OrloReaderSampleMapping.h"
#include "startup/ZEBUtilLib.h"

class SampleAccessTest : public ::testing::Test {
protected:
    void SetUp() override {
        ASSERT_EQ(ZEB::ZEBInitialize(host.Get()), TOV_OK);
        startup = std::make_unique<PluginStartup>(host->AsUnknown());
        ASSERT_EQ(startup->Result(), TOV_OK);
        ASSERT_EQ(host->RegisterBuiltin(OrloRegInfo::CompID_OrloReaderMovSampleMapping,
                                        OrloRegInfo::CLSID_OrloReaderMovSampleMapping, L"OrloReaderSampleMapping",
                                        &ZEB::Impl::OrloReaderSampleMapping::TOVCreate),
                  TOV_OK);
        host.ClearLines();
    }
    void TearDown() override {
        startup.reset();
        ZEB::ZEBTerminate();
    }

    static ZEB::ZEBString Text(const std::string& text) {
        return ZEB::ZEBString(reinterpret_cast<const unsigned char*>(text.c_str()));
    }
    /// A map made through the host's factory, as the container makes it.
    TOVPtr<ISampleMapping> NewMap() {
        TOVPtr<ISampleMapping> map;
        EXPECT_EQ(host->CreateComponent(OrloRegInfo::CompID_OrloReaderMovSampleMapping, nullptr, IID_ISampleMapping,
                                        map.Out()),
                  TOV_OK);
        return map;
    }
    /// The map's class, for SetFilePath.
    static ZEB::Impl::OrloReaderSampleMapping& Concrete(const TOVPtr<ISampleMapping>& map) {
        return dynamic_cast<ZEB::Impl::OrloReaderSampleMapping&>(*map);
    }
    /// A new map that has read the file at `path`.
    TOVPtr<ISampleMapping> MapOf(const std::string& path) {
        TOVPtr<ISampleMapping> map = NewMap();
        EXPECT_TRUE(Concrete(map).SetFilePath(Text(path)));
        return map;
    }
    /// The console lines at any of `levels` that hold `text`.
    size_t LinesWith(uint32_t levels, const std::string& text) const {
        size_t count = 0;
        for (const auto& [level, line] : host.Lines())
            if ((level & levels) != 0 && line.find(text) != std::string::npos) ++count;
        return count;
    }

    TestHost host;
    std::unique_ptr<PluginStartup> startup;
};
