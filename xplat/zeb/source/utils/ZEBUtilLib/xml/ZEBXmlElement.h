#pragma once
/// An element of the lazy XML tree, with an index of its attributes by name.
///
/// Tags and attribute names compare exactly in case. An empty tag argument
/// matches every child element. Deleted children stay visible to the queries
/// (GetElement, CountElement, the GetAll forms) until a Reload; only saving
/// and GetText leave them out.
///
/// A bound element must be loaded (any query does it) before something made
/// in memory is added to it: adding refreshes the attribute index, which
/// refuses an element whose children were never fetched with ZEB_E_NOTREADY.
#include <functional>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "xml/ZEBXmlNode.h"
#include "xml/ZEBXmlPairs.h"

namespace ZEB {
namespace XMLUtils {

class ZEBXmlAttribute;
class ZEBXmlCDATA;
class ZEBXmlText;

class ZEBXmlElement : public ZEBXmlNode {
public:
    static constexpr int32_t kNodeKind = 1;
    int32_t NodeKind() const override { return kNodeKind; }
    /// An element made in memory, status new, with no tag yet.
    ZEBXmlElement();
    explicit ZEBXmlElement(ZEBXmlNode* owner);
    explicit ZEBXmlElement(UTIL::ITOVXmlDomNode* dom);
    /// A copy by CopyTo; a failure is thrown.
    ZEBXmlElement(const ZEBXmlElement& other);
    ZEBXmlElement& operator=(const ZEBXmlElement& other);
    using ZEBXmlNode::operator=;

    /// Fetches the children when not loaded, then indexes the attributes.
    TOVRESULT Load() override;
    /// Re-indexes the attributes, then marks the element changed.
    void OnChanged() override;
    /// The target must be an element. The tag of an element made in memory
    /// is copied too, so that a copy keeps its name.
    TOVRESULT CopyTo(ZEBXmlNode& target) const override;
    /// Children made in memory may have stood anywhere, so the index is made anew.
    TOVRESULT DiscardChanges() override;
    /// Writes the element under its owner's tag, then its attributes, then
    /// its other children. A deleted element writes nothing.
    TOVRESULT Save(UTIL::ITOVXmlWriter* writer) override;

    ZEBString GetTagName();
    /// Whether the tag is `tag`, given in UTF-8.
    bool HasTag(std::string_view tag);
    /// For an element made in memory only; TOV_E_UNEXPECTED otherwise.
    TOVRESULT SetTagName(const ZEBString& tag);

    /// The direct text children joined in order, in UTF-16, untrimmed. Text
    /// of child elements and CDATA sections is not part of it.
    ZEBString GetText();
    /// Replaces the direct text children by one holding `text`.
    TOVRESULT SetText(const ZEBString& text);
    TOVRESULT AppendText(const ZEBString& text);

    /// Load, then add the children of one kind to `out`, which is not
    /// cleared first. The pointers stay owned by the tree.
    TOVRESULT GetAllTexts(std::vector<ZEBXmlText*>& out);
    TOVRESULT GetAllAttributes(std::vector<ZEBXmlAttribute*>& out);
    TOVRESULT GetAllElements(std::vector<ZEBXmlElement*>& out);
    TOVRESULT GetAllCDATAs(std::vector<ZEBXmlCDATA*>& out);
    TOVRESULT GetAllNonAttrChildren(std::vector<ZEBXmlNode*>& out);

    bool HasAttribute(const ZEBString& name);
    /// The first attribute of that name, or null; a deleted one is not found.
    ZEBXmlAttribute* GetAttributeNode(const ZEBString& name);
    /// Its value; ZEB_E_NOTFOUND when there is no such attribute.
    ZEBString GetAttribute(const ZEBString& name);
    /// Changes the value of the attribute of that name, or adds one.
    TOVRESULT SetAttribute(const ZEBString& name, const ZEBString& value);
    /// Marks every attribute of that name deleted. ZEB_E_NOTFOUND when the
    /// element has no attributes at all; a name that matches none is no failure.
    TOVRESULT DeleteAttribute(const ZEBString& name);
    /// Rebuilds the index from the children; ZEB_E_NOTREADY before a load.
    /// Deleted attributes have no name any more and are left out.
    void RefreshAttributeIndex();

    /// 1 when every pair names an attribute whose value equals the pair's.
    /// `flag` 0 lowers both values first; otherwise they compare exactly.
    int IsMatched(const _ZEBXMLATTRPAIR* pairs, unsigned int count, int flag);
    /// 1 when, for any one pair, a child element of that name has the pair's
    /// value as text. `flag` goes to the comparison as its case switch, so 0
    /// ignores case. Deliberately looser than the attribute form.
    int IsMatched(const _ZEBXMLELEMPAIR* pairs, unsigned int count, int flag);

    /// The index-th matching child element, counted from 0, or null.
    ZEBXmlElement* GetElement(const ZEBString& name, unsigned int index);
    /// The same with the tag in UTF-8, for fixed names that need no host string.
    ZEBXmlElement* GetElement(std::string_view tag, unsigned int index);
    ZEBXmlElement* GetElement(const ZEBString& name, const _ZEBXMLATTRPAIR* pairs, unsigned int count,
                              unsigned int index);
    ZEBXmlElement* GetElement(const ZEBString& name, const _ZEBXMLELEMPAIR* pairs, unsigned int count,
                              unsigned int index);
    TOVRESULT GetElements(const ZEBString& name, std::vector<ZEBXmlElement*>& out);
    TOVRESULT GetElements(const ZEBString& name, const _ZEBXMLATTRPAIR* pairs, unsigned int count,
                          std::vector<ZEBXmlElement*>& out);
    TOVRESULT GetElements(const ZEBString& name, const _ZEBXMLELEMPAIR* pairs, unsigned int count,
                          std::vector<ZEBXmlElement*>& out);
    unsigned int CountElement(const ZEBString& name);
    unsigned int CountElement(const ZEBString& name, const _ZEBXMLATTRPAIR* pairs, unsigned int count);
    unsigned int CountElement(const ZEBString& name, const _ZEBXMLELEMPAIR* pairs, unsigned int count);
    /// Matching children made in memory are deleted, bound ones marked
    /// deleted. This form leaves `deleted` as it was; the forms with pairs
    /// write how many matched.
    TOVRESULT DeleteElements(const ZEBString& name, unsigned int& deleted);
    TOVRESULT DeleteElements(const ZEBString& name, const _ZEBXMLATTRPAIR* pairs, unsigned int count,
                             unsigned int& deleted);
    TOVRESULT DeleteElements(const ZEBString& name, const _ZEBXMLELEMPAIR* pairs, unsigned int count,
                             unsigned int& deleted);

    /// Appends a new element of that tag; `*added`, when asked for, is the
    /// element, still owned by the tree.
    TOVRESULT AddElement(const ZEBString& name, ZEBXmlElement** added);
    TOVRESULT AddElement(const ZEBString& name, const ZEBString& text, ZEBXmlElement** added);

protected:
    void DomChanged() override { m_HasTagKey = false; }

private:
    using Filter = std::function<bool(ZEBXmlElement&)>;

    /// The tag as UTF-8, to match tags without a trip through the host's
    /// strings for every child. A bound element's tag never changes, so it is
    /// fetched once per DOM node.
    const std::string& TagKey();

    /// Loads, then calls `visit` for each child element whose tag is `tag`
    /// (UTF-8, empty for any) and that passes `filter`, until `visit` returns false.
    template <class Visit>
    void VisitElements(std::string_view tag, const Filter& filter, Visit&& visit);
    ZEBXmlElement* NthElement(std::string_view tag, const Filter& filter, unsigned int index);
    TOVRESULT CollectElements(const ZEBString& name, const Filter& filter, std::vector<ZEBXmlElement*>& out);
    unsigned int CountElements(std::string_view tag, const Filter& filter);
    /// Deletes the matches; the count of matches when `deleted` is not null.
    TOVRESULT DeleteMatches(const ZEBString& name, const Filter& filter, unsigned int* deleted);
    /// A new element of tag `name`, with `text` when it is not null, appended.
    TOVRESULT AddNewElement(const ZEBString& name, const ZEBString* text, ZEBXmlElement** added);
    template <class Kind>
    TOVRESULT CollectChildren(std::vector<Kind*>& out);

    /// Attribute name in UTF-8 to its position among the children.
    std::map<std::string, int32_t> m_AttributeIndex;
    std::string m_TagKey;
    bool m_HasTagKey = false;
    /// Used only by an element made in memory.
    ZEBString m_TagName;
};

}  // namespace XMLUtils
}  // namespace ZEB
