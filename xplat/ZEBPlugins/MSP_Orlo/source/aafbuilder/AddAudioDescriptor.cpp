#include "aafbuilder/AddAudioDescriptor.h"

#include "aafbuilder/IAAFSmartPointer.h"
#include "clipmodel/TruncateToInteger.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

namespace {

// The compression ids as the host reads them; little-endian integer PCM has none.
constexpr aafUID_t kFloatCompressionUID = {
    0x0E040202, 0x0101, 0x0000, {0x06, 0x0E, 0x2B, 0x34, 0x04, 0x01, 0x01, 0x01}};
constexpr aafUID_t kBigEndianCompressionUID = {
    0x0F020202, 0x0301, 0x0100, {0x06, 0x0E, 0x2B, 0x34, 0x04, 0x01, 0x01, 0x01}};

// The checks that come before any object is touched; the sample rate as AAF
// takes it: the integer part over 1, so 44100.5 becomes 44100/1.
const OrloReader::AudioMediaDescriptor& CheckedSound(const std::shared_ptr<OrloReader::Media>& media,
                                                     aafRational_t& rate) {
    // No media at all counts as media without a sound descriptor.
    const auto sound = media ? media->GetSoundDescriptor() : nullptr;
    if (!sound) throw static_cast<int>(ZEB_E_NOSOUNDDESCRIPTOR);
    rate = {HelperFunctions::TruncateToInt32(sound->GetSampleRate()), 1};
    if (sound->GetFormat() != OrloReader::kAudioFormatPCM) throw static_cast<int>(ZEB_E_AAFCREATE);
    return *sound;
}

void Fill(IAAFPCMDescriptor* descriptor, const OrloReader::AudioMediaDescriptor& sound, const aafRational_t& rate,
          aafLength_t length) {
    IAAFSmartPointer<IAAFPCMDescriptor> pcm(descriptor);
    // The byte rate comes from the exact sample rate; a product beyond 32 bits
    // keeps its low 32 bits.
    const double bytesPerSecond = static_cast<double>(sound.GetBytesPerFrame()) * sound.GetSampleRate();
    TOVCheck(pcm->SetAverageBPS(static_cast<aafUInt32>(HelperFunctions::TruncateToInt64(bytesPerSecond))));
    TOVCheck(pcm->SetBlockAlign(static_cast<aafUInt16>(sound.GetBytesPerPacket())));

    IAAFSmartPointer<IAAFSoundDescriptor> soundDescriptor;
    TOVCheck(pcm->QueryInterface(IID_IAAFSoundDescriptor, reinterpret_cast<void**>(&soundDescriptor)));
    // A big-endian floating-point file is marked as floating point only.
    if (sound.IsFloatingPoint())
        TOVCheck(soundDescriptor->SetCompression(kFloatCompressionUID));
    else if (sound.IsBigEndian())
        TOVCheck(soundDescriptor->SetCompression(kBigEndianCompressionUID));
    TOVCheck(soundDescriptor->SetChannelCount(sound.GetChannelsPerFrame()));
    TOVCheck(soundDescriptor->SetAudioSamplingRate(rate));
    TOVCheck(soundDescriptor->SetQuantizationBits(sound.GetBitsPerChannel()));

    IAAFSmartPointer<IAAFFileDescriptor> file;
    TOVCheck(pcm->QueryInterface(IID_IAAFFileDescriptor, reinterpret_cast<void**>(&file)));
    TOVCheck(file->SetSampleRate(rate));
    TOVCheck(file->SetLength(length));
}

}  // namespace

TOVRESULT AddAudioDescriptor(IAAFPCMDescriptor* descriptor, std::shared_ptr<OrloReader::Media> media) {
    return TOVGuarded([&] {
        aafRational_t rate;
        const OrloReader::AudioMediaDescriptor& sound = CheckedSound(media, rate);
        Fill(descriptor, sound, rate, static_cast<aafLength_t>(media->GetSampleCount()));
        return TOV_OK;
    });
}

TOVRESULT AddAudioDescriptor(OrloReader::Movie*, IAAFDictionary* dictionary, IAAFMultipleDescriptor* multiple,
                             std::shared_ptr<OrloReader::Media> media) {
    return TOVGuarded([&] {
        aafRational_t rate;
        const OrloReader::AudioMediaDescriptor& sound = CheckedSound(media, rate);
        IAAFSmartPointer<IAAFDictionary> dict(dictionary);
        IAAFSmartPointer<IAAFPCMDescriptor> pcm;
        TOVCheck(
            dict->CreateInstance(AUID_AAFPCMDescriptor, IID_IAAFPCMDescriptor, reinterpret_cast<IUnknown**>(&pcm)));
        // The object's identity, held for the rest of the operation.
        IAAFSmartPointer<IUnknown> unknown;
        TOVCheck(pcm->QueryInterface(IID_IUnknown, reinterpret_cast<void**>(&unknown)));
        TOVCheck(pcm->Initialize());
        Fill(pcm, sound, rate, static_cast<aafLength_t>(media->GetSampleCount()));

        if (!multiple) throw static_cast<int>(TOV_E_POINTER);
        IAAFSmartPointer<IAAFFileDescriptor> multipleFile;
        TOVCheck(multiple->QueryInterface(IID_IAAFFileDescriptor, reinterpret_cast<void**>(&multipleFile)));
        aafRational_t multipleRate{};
        TOVCheck(multipleFile->GetSampleRate(&multipleRate));
        if (multipleRate.numerator == 0 && multipleRate.denominator == 0) TOVCheck(multipleFile->SetSampleRate(rate));

        IAAFSmartPointer<IAAFFileDescriptor> appended;
        TOVCheck(pcm->QueryInterface(IID_IAAFFileDescriptor, reinterpret_cast<void**>(&appended)));
        TOVCheck(multiple->AppendFileDescriptor(appended));
        return TOV_OK;
    });
}

}  // namespace Impl
}  // namespace ZEB
