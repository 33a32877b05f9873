// The descriptor extensions against the object model, through the loader.
#include <gtest/gtest.h>

#include <cstring>

#include "AAFTestFile.h"
#include "aaf/AAFDescriptorExtensions.h"

using namespace aaftest;
using namespace ZEB::AAFUtils;

namespace {

constexpr _tovUID kFirst = {0x11111111, 0x2222, 0x3333, {1, 2, 3, 4, 5, 6, 7, 8}};
constexpr _tovUID kSecond = {0x99999999, 0x8888, 0x7777, {8, 7, 6, 5, 4, 3, 2, 1}};

class AAFDescriptorExtensions : public ::testing::Test {
protected:
    TransientFile f{&AAFFileOpenTransient};

    aafUID_t ReadUID(IUnknown* object, const aafUID_t& classId, const aafUID_t& propertyId) {
        Ptr<IAAFClassDef> cls;
        EXPECT_EQ(f.dictionary->LookupClassDef(classId, cls.out()), AAFRESULT_SUCCESS);
        Ptr<IAAFPropertyDef> property;
        EXPECT_EQ(cls->LookupPropertyDef(propertyId, property.out()), AAFRESULT_SUCCESS);
        Ptr<IAAFPropertyValue> value;
        EXPECT_EQ(Query<IAAFObject>(object)->GetPropertyValue(property.get(), value.out()), AAFRESULT_SUCCESS);
        Ptr<IAAFTypeDef> type;
        f.dictionary->LookupTypeDef(kAAFTypeID_AUID, type.out());
        aafUID_t id{};
        EXPECT_EQ(Query<IAAFTypeDefRecord>(type.get())->GetStruct(value.get(), reinterpret_cast<aafMemPtr_t>(&id),
                                                                    sizeof id),
                  AAFRESULT_SUCCESS);
        return id;
    }
};

aafUID_t AsAAF(const _tovUID& id) {
    aafUID_t out;
    std::memcpy(&out, &id, sizeof out);
    return out;
}

TEST_F(AAFDescriptorExtensions, ContainerGUIDsAreSeparateAndTheLastValueStands) {
    auto pcm = f.Create<IAAFEssenceDescriptor>(kAAFClassID_PCMDescriptor);
    EXPECT_EQ(SetMediaContainerGUID(f.dictionary.get(), pcm.get(), kFirst), TOV_OK);
    EXPECT_EQ(SetMediaContainerGUID(f.dictionary.get(), pcm.get(), kSecond), TOV_OK);
    EXPECT_EQ(SetContainerHandlerGUID(f.dictionary.get(), pcm.get(), kFirst), TOV_OK);
    EXPECT_EQ(ReadUID(pcm.get(), kAAFClassID_EssenceDescriptor, kAAFPropID_MediaContainerGUID), AsAAF(kSecond));
    EXPECT_EQ(ReadUID(pcm.get(), kAAFClassID_EssenceDescriptor, kAAFPropID_ContainerHandlerGUID), AsAAF(kFirst));
    aafUInt32 count = 0;
    Query<IAAFObject>(pcm.get())->CountProperties(&count);
    EXPECT_EQ(count, 2u);  // the two dynamic ones: the descriptor was never initialised
}

TEST_F(AAFDescriptorExtensions, MediaAccessKindOnAFileDescriptor) {
    auto pcm = f.Create<IAAFFileDescriptor>(kAAFClassID_PCMDescriptor);
    EXPECT_EQ(SetMediaAccessKind(f.dictionary.get(), pcm.get(), 3), TOV_OK);
    EXPECT_EQ(SetMediaAccessKind(nullptr, pcm.get(), 3), TOV_E_POINTER);
    EXPECT_EQ(SetMediaAccessKind(f.dictionary.get(), nullptr, 3), TOV_E_POINTER);
}

TEST_F(AAFDescriptorExtensions, InsertSequenceWrapsOnceAndKeepsTheSegment) {
    auto mob = f.Create<IAAFMob>(kAAFClassID_SourceMob);
    Query<IAAFSourceMob>(mob.get())->Initialize();
    auto sound = f.DataDef(kAAFDataDef_Sound);
    ASSERT_EQ(Query<IAAFSourceMob>(mob.get())->AddNilReference(2, 100, sound.get(), {25, 1}), AAFRESULT_SUCCESS);
    Ptr<IAAFMobSlot> slot;
    ASSERT_EQ(mob->LookupSlot(2, slot.out()), AAFRESULT_SUCCESS);
    Ptr<IAAFSegment> clip;
    slot->GetSegment(clip.out());
    for (int call = 0; call < 2; ++call) {
        ASSERT_EQ(InsertSequenceToTimelineMobSlot(f.dictionary.get(), slot.get()), TOV_OK);
        Ptr<IAAFSegment> segment;
        slot->GetSegment(segment.out());
        auto sequence = Query<IAAFSequence>(segment.get());
        ASSERT_TRUE(sequence);
        aafUInt32 count = 0;
        sequence->CountComponents(&count);
        EXPECT_EQ(count, 1u);
        Ptr<IAAFComponent> first;
        sequence->GetComponentAt(0, first.out());
        EXPECT_EQ(Query<IUnknown>(first.get()).get(), Query<IUnknown>(clip.get()).get());
        aafLength_t length = 0;
        Query<IAAFComponent>(segment.get())->GetLength(&length);
        EXPECT_EQ(length, 100);
    }
}

TEST_F(AAFDescriptorExtensions, ClassIDOfObjectsButNotOfTheDictionary) {
    auto mob = f.Create<IAAFObject>(kAAFClassID_MasterMob);
    EXPECT_EQ(GetAAFClassID(mob.get()), kAAFClassID_MasterMob);
    auto dictionaryObject = Query<IAAFObject>(f.dictionary.get());
    ASSERT_TRUE(dictionaryObject);
    try {
        GetAAFClassID(dictionaryObject.get());
        FAIL() << "no exception";
    } catch (int result) {
        EXPECT_EQ(result, static_cast<int>(TOV_E_UNEXPECTED));
    }
}

TEST_F(AAFDescriptorExtensions, BoundsBoxTypeIsRegisteredOncePerDictionary) {
    aafUInt32 before = 0, after = 0;
    f.dictionary->CountTypeDefs(&before);
    aafBoundsBox_t box = ToAAFBox({0, 1}, {0, 1}, {1920, 1}, {1080, 1});
    // No image descriptor is at hand: each call registers what it needs,
    // then stops at the missing descriptor.
    EXPECT_EQ(PutBoxesToAAF(f.dictionary.get(), nullptr, box, box, box), TOV_E_POINTER);
    EXPECT_EQ(PutBoxesToAAF(f.dictionary.get(), nullptr, box, box, box), TOV_E_POINTER);
    f.dictionary->CountTypeDefs(&after);
    EXPECT_EQ(after, before + 1);
    Ptr<IAAFTypeDef> type;
    ASSERT_EQ(f.dictionary->LookupTypeDef(kAAFTypeID_OrrinBoundsBox, type.out()), AAFRESULT_SUCCESS);
    auto record = Query<IAAFTypeDefRecord>(type.get());
    Ptr<IAAFPropertyValue> value;
    ASSERT_EQ(record->CreateValueFromStruct(reinterpret_cast<aafMemPtr_t>(&box), sizeof box, value.out()),
              AAFRESULT_SUCCESS);
    Ptr<IAAFPropertyValue> width;
    ASSERT_EQ(record->GetValue(value.get(), 2, width.out()), AAFRESULT_SUCCESS);
    aafCharacter name[16];
    ASSERT_EQ(record->GetMemberName(2, name, sizeof name), AAFRESULT_SUCCESS);
    EXPECT_EQ(std::wstring(name), L"Width");
    Ptr<IAAFTypeDef> rationalType;
    f.dictionary->LookupTypeDef(kAAFTypeID_Rational, rationalType.out());
    aafRational_t w{};
    ASSERT_EQ(Query<IAAFTypeDefRecord>(rationalType.get())
                  ->GetStruct(width.get(), reinterpret_cast<aafMemPtr_t>(&w), sizeof w),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(w.numerator, 1920);
}

}  // namespace
