#include "LoadedModule.h"

#include <gtest/gtest.h>

#include "boundary/OrloRegInfo.h"

LoadedModule::LoadedModule() {
    std::string error;
    EXPECT_EQ(host->LoadModule(ORLO_MODULE, error), TOV_OK) << error;
}

TOVPtr<ITOVString> LoadedModule::Text(const std::string& text) {
    TOVPtr<ITOVString> string;
    EXPECT_EQ(host->CreateComponent(TOVCompID_TOVString, nullptr, IID_ITOVString, string.Out()), TOV_OK);
    EXPECT_EQ(string->Assign(kTOVUnicodeUTF8, reinterpret_cast<const unsigned char*>(text.c_str()),
                             static_cast<unsigned int>(text.size() + 1)),
              TOV_OK);
    return string;
}

TOVPtr<IMediaContainer3> LoadedModule::Container(const std::string& path) {
    TOVPtr<IMediaContainer3> container;
    EXPECT_EQ(host->CreateComponent(OrloRegInfo::CompID_OrloReaderMovContainer, nullptr, IID_IMediaContainer3,
                                    container.Out()),
              TOV_OK);
    if (container && !path.empty()) {
        EXPECT_EQ(container->SetFilePath(Text(path).Get()), TOV_OK);
    }
    return container;
}

std::string TakeText(ITOVString* string) {
    if (!string) return "(null)";
    const unsigned char* text = nullptr;
    string->GetUTF8String(&text);
    std::string copy = text ? reinterpret_cast<const char*>(text) : "";
    string->Release();
    return copy;
}
