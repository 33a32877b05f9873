// The object model's published behaviours and its answers to misuse, through
// the library's own entry point. What the worked examples build is pinned by
// their golden dumps; these cases cover what the examples never do.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "AAFTestFile.h"

using namespace aaftest;

namespace {

aafMobID_t MobID(aafUInt8 last) {
    aafMobID_t id{{0x06, 0x0A, 0x2B, 0x34, 1, 1, 1, 5, 1, 1, 0x0F, 0x20}, 0x13, 0, 0, 0, {}};
    id.material.Data4[7] = last;
    return id;
}

// The one value that `get` of `object` reads.
template <class T, class O>
T Read(O* object, AAFRESULT (O::*get)(T*)) {
    T value{};
    EXPECT_EQ((object->*get)(&value), AAFRESULT_SUCCESS);
    return value;
}

class AAFFixture : public ::testing::Test {
protected:
    TransientFile f{&AAFFileOpenTransient};

    Ptr<IAAFMob> NewMob(const aafUID_t& classId, aafUInt8 idByte) {
        auto mob = f.Create<IAAFMob>(classId);
        if (classId == kAAFClassID_MasterMob) Query<IAAFMasterMob>(mob.get())->Initialize();
        if (classId == kAAFClassID_SourceMob) Query<IAAFSourceMob>(mob.get())->Initialize();
        mob->SetMobID(MobID(idByte));
        return mob;
    }
    Ptr<IAAFMob> NewMasterMob(aafUInt8 idByte) { return NewMob(kAAFClassID_MasterMob, idByte); }
};
using AAFHeader = AAFFixture;
using AAFObject = AAFFixture;
using AAFInterfaces = AAFFixture;
using AAFDictionary = AAFFixture;
using AAFMob = AAFFixture;
using AAFSequence = AAFFixture;
using AAFTaggedValue = AAFFixture;
using AAFClassDef = AAFFixture;

TEST_F(AAFHeader, AddMobRefusesDuplicateIdsSecondPlacementAndUninitialisedMobs) {
    aafNumSlots_t mobs = 99;
    EXPECT_EQ(f.header->CountMobs(kAAFAllMob, &mobs), AAFRESULT_SUCCESS);
    EXPECT_EQ(mobs, 0u);
    auto c = NewMasterMob(2);
    EXPECT_EQ(f.header->AddMob(NewMasterMob(1).get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(f.header->AddMob(NewMasterMob(1).get()), AAFRESULT_DUPLICATE_MOBID);
    EXPECT_EQ(f.header->AddMob(c.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(f.header->AddMob(c.get()), AAFRESULT_DUPLICATE_MOBID);
    Ptr<IAAFMob> found;
    EXPECT_EQ(f.header->LookupMob(MobID(2), found.out()), AAFRESULT_SUCCESS);
    EXPECT_EQ(f.header->LookupMob(MobID(3), found.out()), AAFRESULT_MOB_NOT_FOUND);
    EXPECT_EQ(f.header->AddMob(f.Create<IAAFMob>(kAAFClassID_SourceMob).get()), AAFRESULT_NOT_INITIALIZED);
}

TEST_F(AAFObject, InitializeTwiceFails) {
    auto master = f.Create<IAAFMasterMob>(kAAFClassID_MasterMob);
    auto source = f.Create<IAAFSourceMob>(kAAFClassID_SourceMob);
    auto sequence = f.Create<IAAFSequence>(kAAFClassID_Sequence);
    auto pcm = f.Create<IAAFPCMDescriptor>(kAAFClassID_PCMDescriptor);
    auto sound = f.DataDef(kAAFDataDef_Sound);
    for (int call = 0; call < 2; ++call) {
        const AAFRESULT expected = call == 0 ? AAFRESULT_SUCCESS : AAFRESULT_ALREADY_INITIALIZED;
        EXPECT_EQ(master->Initialize(), expected);
        EXPECT_EQ(source->Initialize(), expected);
        EXPECT_EQ(sequence->Initialize(sound.get()), expected);
        EXPECT_EQ(pcm->Initialize(), expected);
    }
}

TEST_F(AAFInterfaces, NullArgumentsGiveNullParam) {
    auto mob = NewMasterMob(1);
    const std::vector<std::pair<const char*, AAFRESULT>> cases = {
        {"AAFFileOpenTransient ident", AAFFileOpenTransient(nullptr, nullptr)},
        {"GetHeader", f.file->GetHeader(nullptr)},
        {"AddMob", f.header->AddMob(nullptr)},
        {"LookupClassDef", f.dictionary->LookupClassDef(kAAFClassID_MasterMob, nullptr)},
        {"SetName", mob->SetName(nullptr)},
        {"GetMobID", mob->GetMobID(nullptr)},
        {"LookupSlot", mob->LookupSlot(1, nullptr)},
        {"AppendComment", mob->AppendComment(nullptr, L"x")},
        {"AppendNewTimelineSlot", mob->AppendNewTimelineSlot({1, 1}, nullptr, 1, L"a", 0, nullptr)},
        {"NewPhysSourceRef", Query<IAAFMasterMob>(mob.get())->NewPhysSourceRef({1, 1}, 1, nullptr, {}, 1)},
        {"Sequence Initialize", f.Create<IAAFSequence>(kAAFClassID_Sequence)->Initialize(nullptr)},
        {"GetLibraryVersion", AAFGetLibraryVersion(nullptr)},
    };
    for (const auto& c : cases) EXPECT_EQ(c.second, AAFRESULT_NULL_PARAM) << c.first;
}

TEST_F(AAFDictionary, LookupsOfUnknownIdsFail) {
    // Each result lands in a temporary pointer, which releases whatever it was given.
    EXPECT_EQ(NewMasterMob(1)->LookupSlot(7, Ptr<IAAFMobSlot>().out()), AAFRESULT_SLOT_NOT_FOUND);
    EXPECT_EQ(f.dictionary->LookupClassDef(kAAFPropID_Mob_Name, Ptr<IAAFClassDef>().out()), AAFRESULT_OBJECT_NOT_FOUND);
    EXPECT_EQ(f.dictionary->LookupTypeDef(kAAFClassID_Mob, Ptr<IAAFTypeDef>().out()), AAFRESULT_OBJECT_NOT_FOUND);
    EXPECT_EQ(f.dictionary->LookupDataDef(kAAFClassID_Mob, Ptr<IAAFDataDef>().out()), AAFRESULT_OBJECT_NOT_FOUND);
    EXPECT_EQ(f.dictionary->CreateInstance(kAAFClassID_Mob, IID_IAAFMob, Ptr<IUnknown>().out()),
              AAFRESULT_INVALID_PARAM);
}

TEST_F(AAFMob, NewPhysSourceRefMakesTheMissingSlotAndReplacesAClip) {
    auto mob = NewMasterMob(1);
    auto master = Query<IAAFMasterMob>(mob.get());
    auto sound = f.DataDef(kAAFDataDef_LegacySound);
    aafSourceRef_t ref{MobID(9), 2, 100};
    ASSERT_EQ(master->NewPhysSourceRef({48000, 1}, 3, sound.get(), ref, 480), AAFRESULT_SUCCESS);
    ref.sourceSlotID = 4;
    ASSERT_EQ(master->NewPhysSourceRef({48000, 1}, 3, sound.get(), ref, 960), AAFRESULT_SUCCESS);
    EXPECT_EQ(Read(mob.get(), &IAAFMob::CountSlots), 1u);
    Ptr<IAAFMobSlot> slot;
    ASSERT_EQ(mob->LookupSlot(3, slot.out()), AAFRESULT_SUCCESS);
    Ptr<IAAFSegment> segment;
    ASSERT_EQ(slot->GetSegment(segment.out()), AAFRESULT_SUCCESS);
    auto clip = Query<IAAFSourceClip>(segment.get());
    ASSERT_TRUE(clip);
    aafSourceRef_t got{};
    ASSERT_EQ(clip->GetSourceReference(&got), AAFRESULT_SUCCESS);
    EXPECT_EQ(got.sourceSlotID, 4u);
    EXPECT_EQ(Read(Query<IAAFComponent>(segment.get()).get(), &IAAFComponent::GetLength), 960);
    // One object answers every interface of its class and its parents, and no other.
    for (const aafUID_t* iid : {&IID_IAAFSourceReference, &IID_IAAFSourceReference2, &IID_IAAFSegment,
                                &IID_IAAFComponent, &IID_IAAFComponent2, &IID_IAAFObject, &IID_IUnknown}) {
        Ptr<IUnknown> face;
        EXPECT_EQ(clip->QueryInterface(*iid, face.outVoid()), AAFRESULT_SUCCESS);
    }
    EXPECT_EQ(clip->QueryInterface(IID_IAAFSequence, Ptr<IUnknown>().outVoid()), AAF_E_NOINTERFACE);
}

TEST_F(AAFMob, CommentsAreRemovedOnceAndReadIntoBuffersLargeEnough) {
    auto mob = NewMasterMob(1);
    ASSERT_EQ(mob->AppendComment(L"Scene", L"12A"), AAFRESULT_SUCCESS);
    ASSERT_EQ(mob->AppendComment(L"Take", L""), AAFRESULT_SUCCESS);
    Ptr<IEnumAAFTaggedValues> comments;
    ASSERT_EQ(mob->GetComments(comments.out()), AAFRESULT_SUCCESS);
    Ptr<IAAFTaggedValue> first;
    ASSERT_EQ(comments->NextOne(first.out()), AAFRESULT_SUCCESS);
    aafCharacter text[16];
    aafUInt32 read = 0;
    ASSERT_EQ(first->GetValue(sizeof text, reinterpret_cast<aafDataBuffer_t>(text), &read), AAFRESULT_SUCCESS);
    EXPECT_EQ(std::wstring(text), L"12A");
    EXPECT_EQ(read, 4 * sizeof(aafCharacter));
    aafCharacter small[2];
    EXPECT_EQ(first->GetName(small, sizeof small), AAFRESULT_SMALLBUF);
    EXPECT_EQ(mob->RemoveComment(first.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(mob->RemoveComment(first.get()), AAFRESULT_OBJECT_NOT_FOUND);
}

TEST_F(AAFMob, ASegmentSitsInOneSlotOnly) {
    auto mob = NewMasterMob(1);
    auto filler = f.Create<IAAFFiller>(kAAFClassID_Filler);
    filler->Initialize(f.DataDef(kAAFDataDef_Sound).get(), 10);
    auto segment = Query<IAAFSegment>(filler.get());
    EXPECT_EQ(mob->AppendNewTimelineSlot({25, 1}, segment.get(), 1, L"A1", 0, nullptr), AAFRESULT_SUCCESS);
    EXPECT_EQ(mob->AppendNewTimelineSlot({25, 1}, segment.get(), 2, L"A2", 0, nullptr),
              AAFRESULT_OBJECT_ALREADY_ATTACHED);
}

TEST_F(AAFMob, AddMasterSlotRefusesMisuseAndAddsNothing) {
    auto master = NewMasterMob(1);
    auto sourceMob = NewMob(kAAFClassID_SourceMob, 2);
    auto source = Query<IAAFSourceMob>(sourceMob.get());
    auto sound = f.DataDef(kAAFDataDef_LegacySound);
    auto timecode = f.DataDef(kAAFDataDef_Timecode);
    ASSERT_EQ(source->NewPhysSourceRef({48000, 1}, 1, sound.get(), {MobID(3), 2, 1920}, 4800), AAFRESULT_SUCCESS);
    const struct {
        const char* why;
        IAAFDataDef* dataDef;
        aafSlotID_t sourceSlot;
        IAAFSourceMob* sourceMob;
        const wchar_t* name;
        AAFRESULT result;
    } misuse[] = {
        {"another kind of data", timecode.get(), 1, source.get(), L"A1", AAFRESULT_INVALID_DATADEF},
        {"a slot the source lacks", sound.get(), 9, source.get(), L"A1", AAFRESULT_SLOT_NOT_FOUND},
        {"no source", sound.get(), 1, nullptr, L"A1", AAFRESULT_NULL_PARAM},
        {"no name", sound.get(), 1, source.get(), nullptr, AAFRESULT_NULL_PARAM},
    };
    for (const auto& m : misuse) {
        EXPECT_EQ(Query<IAAFMasterMob>(master.get())->AddMasterSlot(m.dataDef, m.sourceSlot, m.sourceMob, 1, m.name),
                  m.result)
            << m.why;
    }
    EXPECT_EQ(Read(master.get(), &IAAFMob::CountSlots), 0u);
}

TEST_F(AAFSequence, LengthFollowsItsComponentsAndOtherDataIsRefused) {
    auto sequence = f.Create<IAAFSequence>(kAAFClassID_Sequence);
    auto timecodeDef = f.DataDef(kAAFDataDef_Timecode);
    sequence->Initialize(timecodeDef.get());
    auto tc = f.Create<IAAFTimecode>(kAAFClassID_Timecode);
    aafTimecode_t value{0, 1, 25};
    ASSERT_EQ(tc->Initialize(100, &value), AAFRESULT_SUCCESS);
    ASSERT_EQ(sequence->AppendComponent(Query<IAAFComponent>(tc.get()).get()), AAFRESULT_SUCCESS);
    auto filler = f.Create<IAAFFiller>(kAAFClassID_Filler);
    filler->Initialize(timecodeDef.get(), 20);
    ASSERT_EQ(sequence->PrependComponent(Query<IAAFComponent>(filler.get()).get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(Read(Query<IAAFComponent>(sequence.get()).get(), &IAAFComponent::GetLength), 120);
    auto soundFiller = f.Create<IAAFFiller>(kAAFClassID_Filler);
    soundFiller->Initialize(f.DataDef(kAAFDataDef_Sound).get(), 1);
    EXPECT_EQ(sequence->AppendComponent(Query<IAAFComponent>(soundFiller.get()).get()), AAFRESULT_INVALID_DATADEF);
    EXPECT_EQ(sequence->GetComponentAt(2, Ptr<IAAFComponent>().out()), AAFRESULT_BADINDEX);
}

TEST_F(AAFObject, DynamicOptionalPropertiesAreAbsentUntilSetAndTypeChecked) {
    const aafUID_t propId = {0x11111111, 0x2222, 0x3333, {4, 4, 4, 4, 4, 4, 4, 4}};
    Ptr<IAAFClassDef> cls;
    ASSERT_EQ(f.dictionary->LookupClassDef(kAAFClassID_EssenceDescriptor, cls.out()), AAFRESULT_SUCCESS);
    Ptr<IAAFTypeDef> type;
    ASSERT_EQ(f.dictionary->LookupTypeDef(kAAFTypeID_UInt32, type.out()), AAFRESULT_SUCCESS);
    Ptr<IAAFPropertyDef> prop, again;
    ASSERT_EQ(cls->RegisterOptionalPropertyDef(propId, L"Extra", type.get(), prop.out()), AAFRESULT_SUCCESS);
    EXPECT_EQ(cls->RegisterOptionalPropertyDef(propId, L"Extra", type.get(), again.out()), AAFRESULT_TABLE_DUP_KEY);

    auto object = f.Create<IAAFObject>(kAAFClassID_PCMDescriptor);
    aafBool present = kAAFTrue;
    ASSERT_EQ(object->IsPropertyPresent(prop.get(), &present), AAFRESULT_SUCCESS);
    EXPECT_EQ(present, kAAFFalse);
    auto integer = Query<IAAFTypeDefInt>(type.get());
    aafUInt32 kind = 3;
    Ptr<IAAFPropertyValue> value, read;
    ASSERT_EQ(integer->CreateValue(reinterpret_cast<aafMemPtr_t>(&kind), 4, value.out()), AAFRESULT_SUCCESS);
    ASSERT_EQ(object->SetPropertyValue(prop.get(), value.get()), AAFRESULT_SUCCESS);
    ASSERT_EQ(object->GetPropertyValue(prop.get(), read.out()), AAFRESULT_SUCCESS);
    aafUInt16 narrow = 0;
    EXPECT_EQ(integer->GetInteger(read.get(), reinterpret_cast<aafMemPtr_t>(&narrow), 2), AAFRESULT_ILLEGAL_VALUE);

    // A property of another class is not this object's.
    Ptr<IAAFClassDef> mobClass;
    f.dictionary->LookupClassDef(kAAFClassID_Mob, mobClass.out());
    Ptr<IAAFPropertyDef> mobName;
    mobClass->LookupPropertyDef(kAAFPropID_Mob_Name, mobName.out());
    EXPECT_EQ(object->IsPropertyPresent(mobName.get(), &present), AAFRESULT_PROPERTY_NOT_FOUND);
}

TEST_F(AAFTaggedValue, BytesOfAnySizeIncludingNone) {
    Ptr<IAAFTypeDef> bytes;
    f.dictionary->LookupTypeDef(kAAFTypeID_UInt8Array, bytes.out());
    aafUInt8 data[3] = {0x42, 0x4D, 0x3A};
    const struct {
        aafUInt8* buffer;
        aafUInt32 size;
        AAFRESULT result;
    } cases[] = {
        {nullptr, 0, AAFRESULT_SUCCESS},
        {data, 0, AAFRESULT_SUCCESS},
        {data, 3, AAFRESULT_SUCCESS},
        {nullptr, 3, AAFRESULT_NULL_PARAM},
    };
    for (const auto& c : cases) {
        auto tagged = f.Create<IAAFTaggedValue>(kAAFClassID_TaggedValue);
        ASSERT_EQ(tagged->Initialize(L"HeadFrame", bytes.get(), c.size, c.buffer), c.result) << c.size;
        if (c.result != AAFRESULT_SUCCESS) continue;
        aafUInt32 length = 99, read = 99;
        ASSERT_EQ(tagged->GetValueBufLen(&length), AAFRESULT_SUCCESS);
        EXPECT_EQ(length, c.size);
        aafUInt8 out[3] = {};
        ASSERT_EQ(tagged->GetValue(sizeof out, out, &read), AAFRESULT_SUCCESS);
        EXPECT_EQ(read, c.size);
        EXPECT_EQ(std::vector<aafUInt8>(out, out + read), std::vector<aafUInt8>(data, data + c.size));
    }
}

TEST_F(AAFClassDef, PictureDescriptorsComeFromACallersConcreteClass) {
    const aafUID_t pictureId = {0x7E57C1A5, 1, 2, {3, 4, 5, 6, 7, 8, 9, 10}};
    EXPECT_EQ(f.dictionary->CreateInstance(kAAFClassID_DigitalImageDescriptor, IID_IAAFDigitalImageDescriptor,
                                           Ptr<IAAFDigitalImageDescriptor>().outUnknown()),
              AAFRESULT_INVALID_PARAM);

    Ptr<IAAFClassDef> parent, cls;
    ASSERT_EQ(f.dictionary->LookupClassDef(kAAFClassID_DigitalImageDescriptor, parent.out()), AAFRESULT_SUCCESS);
    ASSERT_EQ(f.dictionary->CreateMetaInstance(kAAFClassID_ClassDefinition, IID_IAAFClassDef, cls.outUnknown()),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(cls->CreateInstance(IID_IUnknown, Ptr<IUnknown>().out()), AAFRESULT_NOT_INITIALIZED);
    EXPECT_EQ(f.dictionary->RegisterClassDef(cls.get()), AAFRESULT_NOT_INITIALIZED);
    ASSERT_EQ(cls->Initialize(pictureId, parent.get(), L"Picture", kAAFTrue), AAFRESULT_SUCCESS);
    EXPECT_EQ(cls->Initialize(pictureId, parent.get(), L"Picture", kAAFTrue), AAFRESULT_ALREADY_INITIALIZED);
    ASSERT_EQ(f.dictionary->RegisterClassDef(cls.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(f.dictionary->RegisterClassDef(cls.get()), AAFRESULT_TABLE_DUP_KEY);

    auto picture = f.Create<IAAFDigitalImageDescriptor>(pictureId);
    ASSERT_TRUE(picture);
    EXPECT_TRUE(Query<IAAFFileDescriptor>(picture.get()));
    EXPECT_FALSE(Query<IAAFSoundDescriptor>(picture.get()));
    EXPECT_FALSE(Query<IAAFDigitalImageDescriptor>(f.Create<IAAFObject>(kAAFClassID_PCMDescriptor).get()));

    // Its optional properties are absent until set.
    aafUInt32 height = 7, width = 7;
    EXPECT_EQ(picture->GetStoredView(&height, &width), AAFRESULT_PROP_NOT_PRESENT);
    EXPECT_EQ(height, 7u);
    ASSERT_EQ(picture->SetStoredView(1080, 1920), AAFRESULT_SUCCESS);
    ASSERT_EQ(picture->GetStoredView(&height, &width), AAFRESULT_SUCCESS);
    EXPECT_EQ(height, 1080u);
    EXPECT_EQ(width, 1920u);
    EXPECT_EQ(picture->GetStoredView(nullptr, &width), AAFRESULT_NULL_PARAM);
    aafRational_t aspect{};
    EXPECT_EQ(picture->GetImageAspectRatio(&aspect), AAFRESULT_PROP_NOT_PRESENT);
    aafUID_t compression{};
    EXPECT_EQ(picture->GetCompression(&compression), AAFRESULT_PROP_NOT_PRESENT);
}

// Slot lookups in a Mob of many slots follow new ids, given through the slot
// or through the generic interfaces, and removals.
TEST_F(AAFMob, SlotLookupInAManySlotMob) {
    auto mob = f.Create<IAAFMob>(kAAFClassID_SourceMob);
    auto source = Query<IAAFSourceMob>(mob.get());
    ASSERT_EQ(source->Initialize(), AAFRESULT_SUCCESS);
    const auto slotOf = [&](aafSlotID_t id) {
        Ptr<IAAFMobSlot> slot;
        mob->LookupSlot(id, slot.out());
        return slot;
    };
    // The physical number of the slot found by `id`, 0 for none.
    const auto numberOf = [&](aafSlotID_t id) {
        aafUInt32 n = 0;
        auto slot = slotOf(id);
        return slot && AAFRESULT_SUCCEEDED(slot->GetPhysicalNum(&n)) ? n : 0u;
    };
    for (aafSlotID_t id = 1; id <= 40; ++id) {
        ASSERT_EQ(source->AddNilReference(id, 10, f.DataDef(kAAFDataDef_LegacySound).get(), {25, 1}),
                  AAFRESULT_SUCCESS);
        ASSERT_EQ(slotOf(id)->SetPhysicalNum(id), AAFRESULT_SUCCESS);
    }
    EXPECT_EQ(numberOf(41), 0u);
    ASSERT_EQ(slotOf(25)->SetSlotID(99), AAFRESULT_SUCCESS);
    EXPECT_EQ(numberOf(99), 25u);
    EXPECT_EQ(numberOf(25), 0u);
    Ptr<IAAFClassDef> slotClass;
    Ptr<IAAFPropertyDef> slotID;
    Ptr<IAAFPropertyValue> value;
    Ptr<IAAFTypeDef> type;
    f.dictionary->LookupClassDef(kAAFClassID_MobSlot, slotClass.out());
    slotClass->LookupPropertyDef(kAAFPropID_MobSlot_SlotID, slotID.out());
    ASSERT_EQ(Query<IAAFObject>(slotOf(40).get())->GetPropertyValue(slotID.get(), value.out()), AAFRESULT_SUCCESS);
    value->GetType(type.out());
    aafUInt32 renumbered = 77;
    ASSERT_EQ(Query<IAAFTypeDefInt>(type.get())->SetInteger(value.get(), reinterpret_cast<aafMemPtr_t>(&renumbered), 4),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(numberOf(77), 40u);
    ASSERT_EQ(mob->RemoveSlotAt(0), AAFRESULT_SUCCESS);
    EXPECT_EQ(numberOf(1), 0u);
    EXPECT_EQ(numberOf(2), 2u);
}

// Opening a file reuses what released files leave; nothing one registered,
// added or renamed reaches the next.
TEST(AAFLibrary, AFileSeesNoneOfAReleasedFilesDefinitions) {
    const aafUID_t propId = {0x11111111, 0x2222, 0x3333, {5, 5, 5, 5, 5, 5, 5, 5}};
    const aafUID_t classId = {0x7E57C1A5, 9, 9, {9, 9, 9, 9, 9, 9, 9, 9}};
    for (bool rename : {false, true}) {
        for (int file = 0; file < 2; ++file) {
            TransientFile f(&AAFFileOpenTransient);
            Ptr<IAAFClassDef> essence, registered;
            ASSERT_EQ(f.dictionary->LookupClassDef(kAAFClassID_EssenceDescriptor, essence.out()), AAFRESULT_SUCCESS);
            Ptr<IAAFPropertyDef> prop;
            EXPECT_EQ(essence->LookupPropertyDef(propId, prop.out()), AAFRESULT_PROPERTY_NOT_FOUND);
            EXPECT_EQ(f.dictionary->LookupClassDef(classId, registered.out()), AAFRESULT_OBJECT_NOT_FOUND);
            aafCharacter name[64] = {};
            ASSERT_EQ(essence->GetName(name, sizeof name), AAFRESULT_SUCCESS);
            EXPECT_STREQ(name, L"EssenceDescriptor");
            Ptr<IAAFTypeDef> type;
            f.dictionary->LookupTypeDef(kAAFTypeID_UInt32, type.out());
            ASSERT_EQ(essence->RegisterOptionalPropertyDef(propId, L"Extra", type.get(), prop.out()),
                      AAFRESULT_SUCCESS);
            ASSERT_TRUE(f.RegisterConcreteClass(classId, kAAFClassID_SourceMob, L"Extra"));
            if (rename) Query<IAAFMetaDefinition>(essence.get())->SetName(L"Renamed");
        }
    }
}

TEST(AAFLibrary, ResultTexts) {
    aafUInt32 size = 0;
    ASSERT_EQ(AAFResultToTextBufLen(AAFRESULT_DUPLICATE_MOBID, &size), AAFRESULT_SUCCESS);
    std::vector<aafCharacter> text(size / sizeof(aafCharacter));
    ASSERT_EQ(AAFResultToText(AAFRESULT_DUPLICATE_MOBID, text.data(), size), AAFRESULT_SUCCESS);
    EXPECT_EQ(std::wstring(text.data()), L"AAFRESULT_DUPLICATE_MOBID");
    EXPECT_EQ(AAFResultToText(AAFRESULT_DUPLICATE_MOBID, text.data(), size - 1), AAFRESULT_SMALLBUF);
}

}  // namespace
