#pragma once
/// Name and value pairs that select elements: by attribute (`_ZEBXMLATTRPAIR`)
/// or by the text of a child element (`_ZEBXMLELEMPAIR`).
namespace ZEB {
namespace XMLUtils {

/// Both texts are zero-terminated UTF-16.
struct _ZEBXMLATTRPAIR {
    const unsigned short* name;
    const unsigned short* value;
};

struct _ZEBXMLELEMPAIR {
    const unsigned short* name;
    const unsigned short* value;
};

}  // namespace XMLUtils
}  // namespace ZEB
