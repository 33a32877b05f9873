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

// The one value that `get` of `object` reads.
template <class T, class O>
T Read(O* object, AAFRESULT (O::*get)(T*)) {
    T value{};
    EXPECT_EQ((object->*get)(&value), AAFRESULT_SUCCESS);
    return value;
}

class AAFDescriptorExtensions : public ::testing::Test {
protected:
    TransientFile f{&AAFFileOpenTransient};

    Ptr<IAAFPropertyValue> ReadValue(IUnknown* object, const aafUID_t& classId, const aafUID_t& propertyId) {
        Ptr<IAAFClassDef> cls;
        EXPECT_EQ(f.dictionary->LookupClassDef(classId, cls.out()), AAFRESULT_SUCCESS);
        Ptr<IAAFPropertyDef> property;
        EXPECT_EQ(cls->LookupPropertyDef(propertyId, property.out()), AAFRESULT_SUCCESS);
        Ptr<IAAFPropertyValue> value;
        EXPECT_EQ(Query<IAAFObject>(object)->GetPropertyValue(property.get(), value.out()), AAFRESULT_SUCCESS);
        return value;
    }

    /// A record property of `object` as its C struct.
    template <class T>
    T ReadRecord(IUnknown* object, const aafUID_t& classId, const aafUID_t& propertyId, const aafUID_t& typeId) {
        auto value = ReadValue(object, classId, propertyId);
        Ptr<IAAFTypeDef> type;
        f.dictionary->LookupTypeDef(typeId, type.out());
        T out{};
        EXPECT_EQ(Query<IAAFTypeDefRecord>(type.get())
                      ->GetStruct(value.get(), reinterpret_cast<aafMemPtr_t>(&out), sizeof out),
                  AAFRESULT_SUCCESS);
        return out;
    }

    aafUID_t ReadUID(IUnknown* object, const aafUID_t& classId, const aafUID_t& propertyId) {
        return ReadRecord<aafUID_t>(object, classId, propertyId, kAAFTypeID_AUID);
    }

    /// An instance of a concrete picture class registered for the test (once
    /// per file): the published model keeps DigitalImageDescriptor abstract.
    Ptr<IAAFDigitalImageDescriptor> NewPicture() {
        const aafUID_t pictureId = {0x7E57C1A5, 1, 2, {3, 4, 5, 6, 7, 8, 9, 10}};
        EXPECT_TRUE(f.RegisterConcreteClass(pictureId, kAAFClassID_DigitalImageDescriptor, L"Picture"));
        return f.Create<IAAFDigitalImageDescriptor>(pictureId);
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
    // The two dynamic ones: the descriptor was never initialised.
    EXPECT_EQ(Read(Query<IAAFObject>(pcm.get()).get(), &IAAFObject::CountProperties), 2u);
    // The access kind's value is pinned by the golden dumps; here its refusals.
    auto file = Query<IAAFFileDescriptor>(pcm.get());
    EXPECT_EQ(SetMediaAccessKind(nullptr, file.get(), 3), TOV_E_POINTER);
    EXPECT_EQ(SetMediaAccessKind(f.dictionary.get(), nullptr, 3), TOV_E_POINTER);
}

TEST_F(AAFDescriptorExtensions, InsertSequenceWrapsOnceAndKeepsTheSegment) {
    auto mob = f.Create<IAAFMob>(kAAFClassID_SourceMob);
    Query<IAAFSourceMob>(mob.get())->Initialize();
    ASSERT_EQ(Query<IAAFSourceMob>(mob.get())->AddNilReference(2, 100, f.DataDef(kAAFDataDef_Sound).get(), {25, 1}),
              AAFRESULT_SUCCESS);
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
        EXPECT_EQ(Read(sequence.get(), &IAAFSequence::CountComponents), 1u);
        Ptr<IAAFComponent> first;
        sequence->GetComponentAt(0, first.out());
        EXPECT_EQ(Query<IUnknown>(first.get()).get(), Query<IUnknown>(clip.get()).get());
        EXPECT_EQ(Read(Query<IAAFComponent>(segment.get()).get(), &IAAFComponent::GetLength), 100);
    }
}

TEST_F(AAFDescriptorExtensions, ClassIDOfObjectsButNotOfTheDictionary) {
    EXPECT_EQ(GetAAFClassID(f.Create<IAAFObject>(kAAFClassID_MasterMob).get()), kAAFClassID_MasterMob);
    auto dictionaryObject = Query<IAAFObject>(f.dictionary.get());
    ASSERT_TRUE(dictionaryObject);
    int thrown = 0;
    try {
        GetAAFClassID(dictionaryObject.get());
    } catch (int result) {
        thrown = result;
    }
    EXPECT_EQ(thrown, static_cast<int>(TOV_E_UNEXPECTED));
}

// Member by member: rationals and boxes are whole 32-bit numbers without padding.
template <class T>
bool Same(const T& a, const T& b) {
    return std::memcmp(&a, &b, sizeof a) == 0;
}

TEST_F(AAFDescriptorExtensions, BoxesAreSetOnAPictureAndTheirTypeRegisteredOnce) {
    auto picture = NewPicture();
    ASSERT_TRUE(picture);
    const aafUInt32 before = Read(f.dictionary.get(), &IAAFDictionary::CountTypeDefs);
    aafBoundsBox_t essence = ToAAFBox({0, 1}, {0, 1}, {1920, 1}, {1080, 1});
    aafBoundsBox_t source = ToAAFBox({-40, 1}, {-10, 1}, {2000, 1}, {1100, 1});
    aafBoundsBox_t valid = ToAAFBox({19, 2}, {0, 1}, {1901, 1}, {1080, 1});
    // The second call finds the type and the properties, and its values stand.
    EXPECT_EQ(PutBoxesToAAF(f.dictionary.get(), picture.get(), valid, valid, valid), TOV_OK);
    EXPECT_EQ(PutBoxesToAAF(f.dictionary.get(), picture.get(), essence, source, valid), TOV_OK);
    EXPECT_EQ(Read(f.dictionary.get(), &IAAFDictionary::CountTypeDefs), before + 1);
    const struct {
        aafUID_t property;
        const aafBoundsBox_t& expected;
    } boxes[] = {{kAAFPropID_EssenceBox, essence}, {kAAFPropID_SourceBox, source}, {kAAFPropID_ValidBox, valid}};
    for (const auto& box : boxes)
        EXPECT_TRUE(Same(ReadRecord<aafBoundsBox_t>(picture.get(), kAAFClassID_DigitalImageDescriptor, box.property,
                                                    kAAFTypeID_OrrinBoundsBox),
                         box.expected));
    Ptr<IAAFTypeDef> type;
    ASSERT_EQ(f.dictionary->LookupTypeDef(kAAFTypeID_OrrinBoundsBox, type.out()), AAFRESULT_SUCCESS);
    aafCharacter name[16];
    ASSERT_EQ(Query<IAAFTypeDefRecord>(type.get())->GetMemberName(2, name, sizeof name), AAFRESULT_SUCCESS);
    EXPECT_EQ(std::wstring(name), L"Width");
    EXPECT_EQ(PutBoxesToAAF(f.dictionary.get(), nullptr, essence, source, valid), TOV_E_POINTER);
}

TEST_F(AAFDescriptorExtensions, BufferFillOrderTakesKnownDirectionsOnly) {
    auto picture = NewPicture();
    ASSERT_TRUE(picture);
    const struct {
        int order;
        TOVRESULT result;
        aafInt64 stored;  // what the descriptor holds after the call
    } cases[] = {
        {0, TOV_OK, 0}, {7, TOV_OK, 7}, {8, AAFRESULT_ILLEGAL_VALUE, 7}, {-1, AAFRESULT_ILLEGAL_VALUE, 7},
        {2, TOV_OK, 2},
    };
    Ptr<IAAFTypeDef> type;
    f.dictionary->LookupTypeDef(kAAFTypeID_ScanningDirectionType, type.out());
    for (const auto& c : cases) {
        EXPECT_EQ(SetBufferFillOrder(f.dictionary.get(), picture.get(), c.order), c.result) << c.order;
        auto value = ReadValue(picture.get(), kAAFClassID_DigitalImageDescriptor,
                               kAAFPropID_DigitalImageDescriptor_BufferFillOrder);
        aafInt64 stored = -1;
        EXPECT_EQ(Query<IAAFTypeDefEnum>(type.get())->GetIntegerValue(value.get(), &stored), AAFRESULT_SUCCESS);
        EXPECT_EQ(stored, c.stored) << c.order;
    }
}

TEST_F(AAFDescriptorExtensions, ImageRotationLastValueStands) {
    auto picture = NewPicture();
    ASSERT_TRUE(picture);
    for (const aafRational_t rotation : {aafRational_t{90, 1}, aafRational_t{-1, 2}}) {
        ASSERT_EQ(SetImageRotation(f.dictionary.get(), picture.get(), rotation), TOV_OK);
        EXPECT_TRUE(
            Same(ReadRecord<aafRational_t>(picture.get(), kAAFClassID_DigitalImageDescriptor,
                                           kAAFPropID_DigitalImageDescriptor_ImageRotation, kAAFTypeID_Rational),
                 rotation));
    }
    EXPECT_EQ(SetImageRotation(f.dictionary.get(), nullptr, {90, 1}), TOV_E_POINTER);
}

}  // namespace
