#pragma once
/// A string literal turned into an owned, zero-terminated UTF-16 buffer, for
/// the interfaces that take 16-bit text. Failures are thrown as `const char*`
/// messages.
#include "strings/tovStringLiteralRef.h"

class tovUTF16LiteralToUTF16 {
public:
    /// Holds no literal and no buffer; reading it throws.
    tovUTF16LiteralToUTF16();
    /// Keeps `rhs` (not owned) and converts it at once; a null `rhs` throws.
    explicit tovUTF16LiteralToUTF16(tovStringLiteralRef rhs);
    /// Keeps the same literal and converts anew into a buffer of its own.
    tovUTF16LiteralToUTF16(const tovUTF16LiteralToUTF16& rhs);
    tovUTF16LiteralToUTF16& operator=(tovUTF16LiteralToUTF16 rhs);
    ~tovUTF16LiteralToUTF16();

    void swap(tovUTF16LiteralToUTF16& other) noexcept;

    /// Fills the buffer from the literal unless it is already there.
    void ConvertStringRefToUTF16() const;

    /// The buffer; throws when there is none.
    operator unsigned short const*() const;

private:
    tovStringLiteralRef mStrngRef;
    /// Filled lazily by the const conversion, hence mutable.
    mutable unsigned short* mUTF16;
};

/// The empty literal; the string utilities return it for every empty result.
extern const tovUTF16LiteralToUTF16 kEmptyStr16;
/// The literal "/".
extern const tovUTF16LiteralToUTF16 kPathSepStr16;
