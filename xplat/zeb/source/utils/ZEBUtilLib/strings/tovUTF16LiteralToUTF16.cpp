#include "strings/tovUTF16LiteralToUTF16.h"

#include <limits>
#include <utility>

namespace {

constexpr __tovStringLiteralRef kEmptyLiteral = tovStringLiteral(u"");
constexpr __tovStringLiteralRef kPathSepLiteral = tovStringLiteral(u"/");

}  // namespace

const tovUTF16LiteralToUTF16 kEmptyStr16(&kEmptyLiteral);
const tovUTF16LiteralToUTF16 kPathSepStr16(&kPathSepLiteral);

tovUTF16LiteralToUTF16::tovUTF16LiteralToUTF16() : mStrngRef(nullptr), mUTF16(nullptr) {}

tovUTF16LiteralToUTF16::tovUTF16LiteralToUTF16(tovStringLiteralRef rhs) : mStrngRef(rhs), mUTF16(nullptr) {
    if (!rhs) throw "tovUTF16LiteralToUTF16::tovUTF16LiteralToUTF16(tovStringLiteralRef rhs) failed with rhs == 0!";
    ConvertStringRefToUTF16();
}

tovUTF16LiteralToUTF16::tovUTF16LiteralToUTF16(const tovUTF16LiteralToUTF16& rhs)
    : mStrngRef(rhs.mStrngRef), mUTF16(nullptr) {
    ConvertStringRefToUTF16();
}

tovUTF16LiteralToUTF16& tovUTF16LiteralToUTF16::operator=(tovUTF16LiteralToUTF16 rhs) {
    swap(rhs);
    return *this;
}

tovUTF16LiteralToUTF16::~tovUTF16LiteralToUTF16() { delete[] mUTF16; }

void tovUTF16LiteralToUTF16::swap(tovUTF16LiteralToUTF16& other) noexcept {
    std::swap(mStrngRef, other.mStrngRef);
    std::swap(mUTF16, other.mUTF16);
}

void tovUTF16LiteralToUTF16::ConvertStringRefToUTF16() const {
    if (mUTF16) return;
    if (!mStrngRef) throw "tovUTF16LiteralToUTF16::ConvertStringRefToUTF16 failed with mStrngRef == 0!";
    const std::size_t length = mStrngRef->Length();
    // A count that cannot be represented asks for the largest array, so the
    // allocation fails rather than coming back too small.
    const std::size_t units = length < std::numeric_limits<std::size_t>::max() ? length + 1 : length;
    mUTF16 = new unsigned short[units];
    if (!mStrngRef->GetCString(mUTF16, length * 2 + 2, kTOVStringEncodingUnicode)) {
        delete[] mUTF16;
        mUTF16 = nullptr;
        throw "tovUTF16LiteralToUTF16::ConvertStringRefToUTF16 failed because CFStringGetCString return FALSE!";
    }
    mUTF16[length] = 0;
}

tovUTF16LiteralToUTF16::operator unsigned short const*() const {
    if (!mUTF16) throw "tovUTF16LiteralToUTF16: mUTF16 was NULL!";
    return mUTF16;
}
