#include "ExampleClips.h"

#include <cmath>
#include <cstdio>
#include <stdexcept>
#include <string>

#include "AAFTestFile.h"
#include "aaf/AAFDescriptorExtensions.h"

namespace aaftest {

namespace {

using ZEB::AAFUtils::InsertSequenceToTimelineMobSlot;

void Must(AAFRESULT result, const char* what) {
    if (AAFRESULT_FAILED(result)) {
        char text[160];
        std::snprintf(text, sizeof text, "%s failed with 0x%08X", what, static_cast<unsigned>(result));
        throw std::runtime_error(text);
    }
}

// The container's component id, which is also the clip's container GUID.
constexpr _tovUID kContainerID = {0x3711D3CC, 0x62D0, 0x49D7, {0xB0, 0xAE, 0xC1, 0x18, 0x10, 0x1D, 0x1A, 0x16}};
constexpr aafRational_t kMovieRate{25, 1};
constexpr aafRational_t kTapeRate{25, 1};
constexpr aafRational_t kSampleRate{48000, 1};
constexpr aafLength_t kSamples = 480000;
constexpr aafPosition_t kStartOffset = 900000;  // 10:00:00:00 at 25 frames

aafMobID_t BaseMobID() {
    aafMobID_t id{{0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x05, 0x01, 0x01, 0x0F, 0x20},      0x13, 0x00, 0x00, 0x00,
                  {0x4F524C4F, 0x0001, 0x0002, {0x10, 0x20, 0x30, 0x40, 0x50, 0x60, 0x70, 0x80}}};
    return id;
}

aafMobID_t WithByte13(aafUInt8 value) {
    aafMobID_t id = BaseMobID();
    id.instanceHigh = value;
    return id;
}

aafProductIdentification_t* Identification() {
    static aafProductVersion_t version{1, 9, 1, 10178, kAAFVersionUnknown};
    static aafCharacter company[] = L"Orrin Technology, Inc.";
    static aafCharacter product[] = L"Orlo Plug-In";
    static aafCharacter versionText[] = L"1.9.1.10178";
    static aafCharacter platform[] = L"MacOS X";
    static aafProductIdentification_t ident{
        company,  product, versionText, {0x3711D3CC, 0x62D0, 0x49D7, {0xB0, 0xAE, 0xC1, 0x18, 0x10, 0x1D, 0x1A, 0x16}},
        platform, &version};
    return &ident;
}

struct Mob {
    Ptr<IAAFMob> mob;
    Ptr<IAAFMasterMob> master;
    Ptr<IAAFSourceMob> source;
};

class Builder {
public:
    Builder() : f(&AAFFileOpenTransient, Identification()) {
        if (!f.dictionary) throw std::runtime_error("AAFFileOpenTransient failed");
        sound = f.DataDef(kAAFDataDef_LegacySound);
        timecode = f.DataDef(kAAFDataDef_Timecode);
    }

    Mob NewMob(const aafUID_t& classId, const aafMobID_t& id, const wchar_t* name) {
        Mob m;
        m.mob = f.Create<IAAFMob>(classId);
        if (classId == kAAFClassID_MasterMob) {
            m.master = Query<IAAFMasterMob>(m.mob.get());
            Must(m.master->Initialize(), "MasterMob Initialize");
        } else {
            m.source = Query<IAAFSourceMob>(m.mob.get());
            Must(m.source->Initialize(), "SourceMob Initialize");
        }
        Must(m.mob->SetMobID(id), "SetMobID");
        if (name) Must(m.mob->SetName(name), "SetName");
        return m;
    }

    // The tape's one timecode slot, as the clip builders make it.
    void AddTimecodeSlot(IAAFMob* tape, aafLength_t length = 25 * 432000, aafPosition_t start = 0) {
        auto sequence = f.Create<IAAFSequence>(kAAFClassID_Sequence);
        Must(sequence->Initialize(timecode.get()), "Sequence Initialize");
        auto component = f.Create<IAAFComponent>(kAAFClassID_Timecode);
        aafTimecode_t tc{start, 0, 25};
        Must(Query<IAAFTimecode>(component.get())->Initialize(length, &tc), "Timecode Initialize");
        Must(component->SetDataDef(timecode.get()), "SetDataDef");
        Must(component->SetLength(length), "SetLength");
        Must(sequence->AppendComponent(component.get()), "AppendComponent");
        Must(tape->AppendNewTimelineSlot(kTapeRate, Query<IAAFSegment>(sequence.get()).get(), 1, L"TC1", 0, nullptr),
             "AppendNewTimelineSlot");
        Ptr<IAAFMobSlot> slot;
        Must(tape->LookupSlot(1, slot.out()), "LookupSlot");
        Must(slot->SetPhysicalNum(1), "SetPhysicalNum");
    }

    Ptr<IAAFMobSlot> Slot(IAAFMob* mob, aafSlotID_t id) {
        Ptr<IAAFMobSlot> slot;
        Must(mob->LookupSlot(id, slot.out()), "LookupSlot");
        return slot;
    }

    void FinishSlot(IAAFMob* mob, aafSlotID_t id, aafUInt32 physical, const wchar_t* name) {
        auto slot = Slot(mob, id);
        Must(slot->SetPhysicalNum(physical), "SetPhysicalNum");
        if (name) Must(slot->SetName(name), "SetName");
        Must(InsertSequenceToTimelineMobSlot(f.dictionary.get(), slot.get()), "InsertSequenceToTimelineMobSlot");
    }

    Ptr<IAAFSourceReference2> Reference(IAAFMob* mob, aafSlotID_t id) {
        Ptr<IAAFSegment> segment;
        Must(Slot(mob, id)->GetSegment(segment.out()), "GetSegment");
        return Query<IAAFSourceReference2>(Query<IAAFSourceClip>(segment.get()).get());
    }

    void AddNilTapeSlot(IAAFSourceMob* tape, IAAFMob* tapeMob, aafSlotID_t id, aafUInt32 physical, const wchar_t* name,
                        aafLength_t length) {
        const double padding = std::ceil(kMovieRate.numerator * 172800.0 / kMovieRate.denominator);
        const aafLength_t padded = length < padding ? length + static_cast<aafLength_t>(padding) : length;
        Must(tape->AddNilReference(id, padded, sound.get(), kMovieRate), "AddNilReference");
        FinishSlot(tapeMob, id, physical, name);
    }

    Ptr<IAAFPCMDescriptor> NewPCM(aafLength_t length) {
        auto pcm = f.Create<IAAFPCMDescriptor>(kAAFClassID_PCMDescriptor);
        Must(pcm->Initialize(), "PCM Initialize");
        Must(pcm->SetAverageBPS(48000 * 6), "SetAverageBPS");
        Must(pcm->SetBlockAlign(6), "SetBlockAlign");
        auto sound = Query<IAAFSoundDescriptor>(pcm.get());
        Must(sound->SetChannelCount(2), "SetChannelCount");
        Must(sound->SetAudioSamplingRate(kSampleRate), "SetAudioSamplingRate");
        Must(sound->SetQuantizationBits(24), "SetQuantizationBits");
        auto file = Query<IAAFFileDescriptor>(pcm.get());
        Must(file->SetSampleRate(kSampleRate), "SetSampleRate");
        Must(file->SetLength(length), "SetLength");
        return pcm;
    }

    void AddLocator(IAAFEssenceDescriptor* descriptor, const wchar_t* url) {
        auto locator = f.Create<IAAFNetworkLocator>(kAAFClassID_NetworkLocator);
        auto asLocator = Query<IAAFLocator>(locator.get());
        Must(asLocator->SetPath(url), "SetPath");
        Must(descriptor->AppendLocator(asLocator.get()), "AppendLocator");
        Must(ZEB::AAFUtils::SetMediaContainerGUID(f.dictionary.get(), descriptor, kContainerID),
             "SetMediaContainerGUID");
    }

    void SetImportDescriptor(IAAFSourceMob* tape, const wchar_t* url) {
        auto import = f.Create<IAAFImportDescriptor>(kAAFClassID_ImportDescriptor);
        auto essence = Query<IAAFEssenceDescriptor>(import.get());
        AddLocator(essence.get(), url);
        Must(tape->SetEssenceDescriptor(essence.get()), "SetEssenceDescriptor");
    }

    IAAFFile* Finish(const std::vector<IAAFMob*>& mobs) {
        for (IAAFMob* mob : mobs) Must(f.header->AddMob(mob), "AddMob");
        f.file->AddRef();
        return f.file.get();
    }

    TransientFile f;
    Ptr<IAAFDataDef> sound;
    Ptr<IAAFDataDef> timecode;
};

}  // namespace

IAAFFile* BuildStereoClip() {
    Builder b;
    Mob master = b.NewMob(kAAFClassID_MasterMob, BaseMobID(), L"Scene 12A Take 3");
    Mob file = b.NewMob(kAAFClassID_SourceMob, WithByte13(0xB1), L"TAPE-0001");
    Mob tape = b.NewMob(kAAFClassID_SourceMob, WithByte13(0xA1), L"TAPE-0001");
    auto pcm = b.NewPCM(kSamples);
    b.AddTimecodeSlot(tape.mob.get());
    const aafSlotID_t base = 1;  // one timecode slot
    const aafRational_t audioRate{kSampleRate.numerator, 1};
    const wchar_t* names[] = {L"A1", L"A2"};
    for (aafUInt32 t = 1; t <= 2; ++t) {
        // Master slot t refers to the file Mob's one slot, channel t.
        aafSourceRef_t toFile{WithByte13(0xB1), base + 1, 0};
        Must(master.master->NewPhysSourceRef(audioRate, base + t, b.sound.get(), toFile, kSamples), "NewPhysSourceRef");
        auto slot = b.Slot(master.mob.get(), base + t);
        Must(slot->SetPhysicalNum(t), "SetPhysicalNum");
        Must(slot->SetName(names[t - 1]), "SetName");
        auto ref = b.Reference(master.mob.get(), base + t);
        Must(ref->SetSourceID(WithByte13(0xB1)), "SetSourceID");
        Must(ref->SetSourceMobSlotID(base + 1), "SetSourceMobSlotID");
        aafUInt32 channel = t;
        Must(ref->SetChannelIDs(1, &channel), "SetChannelIDs");
        Must(InsertSequenceToTimelineMobSlot(b.f.dictionary.get(), slot.get()), "InsertSequence");
        if (t == 1) {
            aafSourceRef_t toTape{WithByte13(0xA1), base + t, kStartOffset};
            Must(file.source->NewPhysSourceRef(audioRate, base + 1, b.sound.get(), toTape, kSamples),
                 "NewPhysSourceRef");
            Must(b.Slot(file.mob.get(), base + 1)->SetPhysicalNum(1), "SetPhysicalNum");
            auto fileRef = b.Reference(file.mob.get(), base + 1);
            Must(fileRef->SetSourceID(WithByte13(0xA1)), "SetSourceID");
            Must(fileRef->SetSourceMobSlotID(0), "SetSourceMobSlotID");
            aafUInt32 mono[] = {base + 1, base + 2};
            Must(fileRef->SetMonoSourceSlotIDs(2, mono), "SetMonoSourceSlotIDs");
            Must(InsertSequenceToTimelineMobSlot(b.f.dictionary.get(), b.Slot(file.mob.get(), base + 1).get()),
                 "InsertSequence");
        }
        b.AddNilTapeSlot(tape.source.get(), tape.mob.get(), base + t, t, names[t - 1], kSamples);
    }
    const wchar_t* url = L"file:///media/day1/Scene12A_T3.wav";
    auto essence = Query<IAAFEssenceDescriptor>(pcm.get());
    b.AddLocator(essence.get(), url);
    Must(ZEB::AAFUtils::SetMediaAccessKind(b.f.dictionary.get(), Query<IAAFFileDescriptor>(pcm.get()).get(), 3),
         "SetMediaAccessKind");
    Must(file.source->SetEssenceDescriptor(essence.get()), "SetEssenceDescriptor");
    b.SetImportDescriptor(tape.source.get(), url);
    Must(master.mob->AppendComment(L"Scene", L"12A"), "AppendComment");
    Must(master.mob->AppendComment(L"Take", L"3"), "AppendComment");
    return b.Finish({master.mob.get(), file.mob.get(), tape.mob.get()});
}

IAAFFile* BuildGroupedClip(const std::vector<aafUInt32>& channels) {
    Builder b;
    Mob master = b.NewMob(kAAFClassID_MasterMob, BaseMobID(), L"Group");
    Mob tape = b.NewMob(kAAFClassID_SourceMob, WithByte13(0xA1), L"TAPE-0002");
    std::vector<Mob> files;
    for (size_t i = 0; i < channels.size(); ++i)
        files.push_back(b.NewMob(kAAFClassID_SourceMob, WithByte13(static_cast<aafUInt8>(0xB1 + i)), L"TAPE-0002"));
    b.AddTimecodeSlot(tape.mob.get());
    const aafSlotID_t base = 1;
    const aafLength_t groupLength = kSamples / 1920;  // in edit units of the movie rate
    aafUInt32 highest = 0;
    size_t i = 0;
    std::vector<Ptr<IAAFPCMDescriptor>> descriptors;
    for (aafUInt32 c : channels) {
        auto pcm = b.NewPCM(kSamples);
        while (highest < c) {
            const aafUInt32 n = highest++;
            wchar_t name[32];
            std::swprintf(name, 32, L"A%d", highest);
            const aafSlotID_t s = base + n + 1;
            if (n == c - base) {
                aafSourceRef_t toFile{WithByte13(static_cast<aafUInt8>(0xB1 + i)), base + 1, 0};
                Must(master.master->NewPhysSourceRef(kMovieRate, base + 1 + static_cast<aafSlotID_t>(i), b.sound.get(),
                                                     toFile, groupLength),
                     "NewPhysSourceRef");
                b.FinishSlot(master.mob.get(), base + 1 + static_cast<aafSlotID_t>(i), c, name);
                aafSourceRef_t toTape{WithByte13(0xA1), s, kStartOffset};
                Must(files[i].source->NewPhysSourceRef(kMovieRate, base + 1, b.sound.get(), toTape, groupLength),
                     "NewPhysSourceRef");
                b.FinishSlot(files[i].mob.get(), base + 1, c, name);
                auto essence = Query<IAAFEssenceDescriptor>(pcm.get());
                Must(ZEB::AAFUtils::SetMediaAccessKind(b.f.dictionary.get(), Query<IAAFFileDescriptor>(pcm.get()).get(),
                                                       3),
                     "SetMediaAccessKind");
                std::wstring url = L"file:///media/day1/Group_" + std::to_wstring(c) + L".wav";
                b.AddLocator(essence.get(), url.c_str());
                Must(files[i].source->SetEssenceDescriptor(essence.get()), "SetEssenceDescriptor");
                descriptors.push_back(std::move(pcm));
                ++i;
            }
            b.AddNilTapeSlot(tape.source.get(), tape.mob.get(), s, c, name, groupLength);
        }
    }
    b.SetImportDescriptor(tape.source.get(), L"file:///media/day1/Group_1.wav");
    std::vector<IAAFMob*> mobs{master.mob.get()};
    for (auto& file : files) mobs.push_back(file.mob.get());
    mobs.push_back(tape.mob.get());
    return b.Finish(mobs);
}

namespace {

/// The head frame bitmap as a tagged value appended to the Mob's Attributes
/// through the generic property interface, as the volume route adds it.
void AppendHeadFrame(Builder& b, IAAFMob* master, std::vector<aafUInt8> bitmap) {
    IAAFDictionary* d = b.f.dictionary.get();
    Ptr<IAAFTypeDef> bytes, reference, vector;
    Must(d->LookupTypeDef(kAAFTypeID_UInt8Array, bytes.out()), "LookupTypeDef UInt8Array");
    auto tagged = b.f.Create<IAAFTaggedValue>(kAAFClassID_TaggedValue);
    Must(tagged->Initialize(L"HeadFrame", bytes.get(), static_cast<aafUInt32>(bitmap.size()), bitmap.data()),
         "TaggedValue Initialize");
    Must(d->LookupTypeDef(kAAFTypeID_TaggedValueStrongReference, reference.out()), "LookupTypeDef reference");
    Ptr<IAAFPropertyValue> element, attributes;
    Must(Query<IAAFTypeDefObjectRef>(reference.get())->CreateValue(tagged.get(), element.out()), "CreateValue");
    Ptr<IAAFClassDef> mobClass;
    Must(d->LookupClassDef(kAAFClassID_Mob, mobClass.out()), "LookupClassDef Mob");
    Ptr<IAAFPropertyDef> property;
    Must(mobClass->LookupPropertyDef(kAAFPropID_Mob_Attributes, property.out()), "LookupPropertyDef Attributes");
    auto object = Query<IAAFObject>(master);
    aafBoolean_t present = kAAFFalse;
    Must(object->IsPropertyPresent(property.get(), &present), "IsPropertyPresent");
    if (present)
        Must(object->GetPropertyValue(property.get(), attributes.out()), "GetPropertyValue");
    else
        Must(object->CreateOptionalPropertyValue(property.get(), attributes.out()), "CreateOptionalPropertyValue");
    Must(d->LookupTypeDef(kAAFTypeID_TaggedValueStrongReferenceVector, vector.out()), "LookupTypeDef vector");
    Must(Query<IAAFTypeDefVariableArray>(vector.get())->AppendElement(attributes.get(), element.get()),
         "AppendElement");
}

/// One memo: a descriptive marker at `offset` with its comment, appended to
/// the event slot's sequence, which the first memo makes.
void AddMark(Builder& b, Ptr<IAAFEventMobSlot>& slot, Ptr<IAAFSequence>& marks, aafPosition_t offset,
             const wchar_t* text) {
    Ptr<IAAFDataDef> descriptive = b.f.DataDef(kAAFDataDef_DescriptiveMetadata);
    auto marker = b.f.Create<IAAFDescriptiveMarker>(kAAFClassID_DescriptiveMarker);
    Must(marker->Initialize(), "DescriptiveMarker Initialize");
    auto event = Query<IAAFEvent>(Query<IAAFCommentMarker>(marker.get()).get());
    Must(event->SetPosition(offset), "SetPosition");
    Must(Query<IAAFComponent2>(marker.get())->AppendComment(L"Comment", text), "Component AppendComment");
    auto component = Query<IAAFComponent>(marker.get());
    Must(component->SetDataDef(descriptive.get()), "SetDataDef");
    if (!slot) {
        slot = b.f.Create<IAAFEventMobSlot>(kAAFClassID_EventMobSlot);
        aafRational_t rate = kMovieRate;
        Must(slot->SetEditRate(&rate), "SetEditRate");
        auto mobSlot = Query<IAAFMobSlot>(slot.get());
        Must(mobSlot->SetPhysicalNum(1), "SetPhysicalNum");
        marks = b.f.Create<IAAFSequence>(kAAFClassID_Sequence);
        Must(Query<IAAFComponent>(marks.get())->SetDataDef(descriptive.get()), "Sequence SetDataDef");
        Must(marks->AppendComponent(component.get()), "AppendComponent");
        Must(mobSlot->SetSegment(Query<IAAFSegment>(marks.get()).get()), "SetSegment");
        Must(mobSlot->SetSlotID(1001), "SetSlotID");
    } else {
        Must(marks->AppendComponent(component.get()), "AppendComponent");
    }
}

/// Physical numbers 1 for the first three slots, 2 for the rest.
void SetPhysicalTrack(IAAFMob* mob) {
    aafNumSlots_t count = 0;
    Must(mob->CountSlots(&count), "CountSlots");
    for (aafUInt32 i = 0; i < count; ++i) {
        Ptr<IAAFMobSlot> slot;
        Must(mob->GetSlotAt(i, slot.out()), "GetSlotAt");
        Must(slot->SetPhysicalNum(i < 3 ? 1 : 2), "SetPhysicalNum");
    }
}

}  // namespace

IAAFFile* BuildMetadataClip() {
    Builder b;
    const aafMobID_t sourceID = WithByte13(0xB1), sfileID = WithByte13(0xA1);
    Mob master = b.NewMob(kAAFClassID_MasterMob, BaseMobID(), L"Clip0001");
    Mob sfile = b.NewMob(kAAFClassID_SourceMob, sfileID, nullptr);
    auto import = b.f.Create<IAAFImportDescriptor>(kAAFClassID_ImportDescriptor);
    auto importEssence = Query<IAAFEssenceDescriptor>(import.get());
    Mob source = b.NewMob(kAAFClassID_SourceMob, sourceID, nullptr);
    const aafPosition_t startFrame = 90000;  // 01:00:00:00 at 25 frames
    b.AddTimecodeSlot(sfile.mob.get(), 172800, startFrame);
    const aafSlotID_t timecodeSlots = 1;
    const aafRational_t sampleRate{48000, 1};
    const double ratio = (static_cast<float>(kMovieRate.denominator) * sampleRate.numerator) /
                         (static_cast<float>(kMovieRate.numerator) * sampleRate.denominator);
    const aafPosition_t position = static_cast<aafPosition_t>(startFrame * ratio);
    const wchar_t* url = L"file:///media/card1/Clip0001.vid";
    for (aafUInt32 track = 1; track <= 2; ++track) {
        const aafSlotID_t slot = track + timecodeSlots;
        aafSourceRef_t toSfile{sfileID, slot, position};
        Must(source.source->NewPhysSourceRef(sampleRate, track, b.sound.get(), toSfile, kSamples), "NewPhysSourceRef");
        wchar_t name[12];
        std::swprintf(name, 12, L"A%d", track);
        aafNumSlots_t count = 0;
        Must(master.mob->CountSlots(&count), "CountSlots");
        Must(master.master->AddMasterSlot(b.sound.get(), track, source.source.get(), count + 1, name), "AddMasterSlot");
        const double padding = std::ceil(kMovieRate.numerator * 172800.0 / kMovieRate.denominator);
        const aafLength_t length = kSamples + (kSamples < padding ? static_cast<aafLength_t>(padding) : 0);
        Must(sfile.source->AddNilReference(slot, length, b.sound.get(), sampleRate), "AddNilReference");
        Must(b.Slot(sfile.mob.get(), slot)->SetName(name), "SetName");
        Must(b.Slot(source.mob.get(), track)->SetName(name), "SetName");
        auto locator = b.f.Create<IAAFNetworkLocator>(kAAFClassID_NetworkLocator);
        Must(Query<IAAFLocator>(locator.get())->SetPath(url), "SetPath");
        Must(importEssence->AppendLocator(Query<IAAFLocator>(locator.get()).get()), "AppendLocator");
    }
    Must(master.mob->AppendComment(L"Shooter", L"Camera B"), "AppendComment");
    Ptr<IAAFEventMobSlot> eventSlot;
    Ptr<IAAFSequence> marks;
    AddMark(b, eventSlot, marks, 0, L"Slate");
    AddMark(b, eventSlot, marks, 125, L"Clap (Sound Op)");
    AddMark(b, eventSlot, marks, 250, L"Cut");

    Must(master.mob->AppendSlot(Query<IAAFMobSlot>(eventSlot.get()).get()), "AppendSlot");
    for (IAAFMob* mob : {master.mob.get(), source.mob.get(), sfile.mob.get()}) SetPhysicalTrack(mob);
    auto multiple = b.f.Create<IAAFMultipleDescriptor>(kAAFClassID_MultipleDescriptor);
    Must(multiple->Initialize(), "MultipleDescriptor Initialize");
    for (int track = 0; track < 2; ++track) {
        auto pcm = b.NewPCM(kSamples);
        b.AddLocator(Query<IAAFEssenceDescriptor>(pcm.get()).get(), url);
        Must(multiple->AppendFileDescriptor(Query<IAAFFileDescriptor>(pcm.get()).get()), "AppendFileDescriptor");
    }
    Must(source.source->SetEssenceDescriptor(Query<IAAFEssenceDescriptor>(multiple.get()).get()),
         "SetEssenceDescriptor");
    Must(sfile.source->SetEssenceDescriptor(importEssence.get()), "SetEssenceDescriptor");
    auto master2 = Query<IAAFMob2>(master.mob.get());
    Must(master2->AppendAttribute(L"HeadFrameType", L"BMP"), "AppendAttribute");
    Must(master2->AppendAttribute(L"HeadFrameOffset", L"12"), "AppendAttribute");
    AppendHeadFrame(b, master.mob.get(), {'B', 'M', 0x3A, 0, 0, 0});
    return b.Finish({master.mob.get(), source.mob.get(), sfile.mob.get()});
}

}  // namespace aaftest
