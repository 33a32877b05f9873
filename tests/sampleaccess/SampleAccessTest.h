#pragma once
/// A fixture that starts the plug-in on a test host as the module does, with
/// the sample map registered, so that maps are made through the host's
/// factory and the console lines can be read.
#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "TestHost.h"
#include "boundary/PluginStartup.h"
#include "sampleaccess/OrloReaderSampleMapping.h"
#include "strings/ZEBString.h"

class SampleAccessTest : public ::testing::Test {
protected:
    void SetUp() override;
    void TearDown() override;

    static ZEB::ZEBString Text(const std::string& text);
    /// A map made through the host's factory, as the container makes it.
    TOVPtr<ISampleMapping> NewMap();
    /// The map's class, for SetFilePath.
    static ZEB::Impl::OrloReaderSampleMapping& Concrete(const TOVPtr<ISampleMapping>& map);
    /// A new map that has read the file at `path`.
    TOVPtr<ISampleMapping> MapOf(const std::string& path);
    /// The console lines at any of `levels` that hold `text`.
    size_t LinesWith(uint32_t levels, const std::string& text) const;

    TestHost host;
    std::unique_ptr<PluginStartup> startup;
};

/// The references `object` holds.
uint32_t References(ITOVUnknown* object);
