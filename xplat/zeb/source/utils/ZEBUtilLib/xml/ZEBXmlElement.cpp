#include "xml/ZEBXmlElement.h"

#include <algorithm>
#include <memory>
#include <optional>

#include "tov/sdk/TOVFailureStyle.h"
#include "tov/sdk/TOVPtr.h"
#include "xml/ZEBXmlAttribute.h"
#include "xml/ZEBXmlCDATA.h"
#include "xml/ZEBXmlText.h"

namespace ZEB {
namespace XMLUtils {

namespace {

[[noreturn]] void Throw(TOVRESULT result) { throw static_cast<int>(result); }

std::string IndexKey(const ZEBString& name) { return reinterpret_cast<const char*>(name.GetUTF8String()); }

// A tag argument in UTF-8: tags compare exactly, code point by code point, so
// as UTF-8 bytes. No string at all is the empty tag, which matches any.
std::string WantedTag(const ZEBString& name) { return name.IsEmpty() ? std::string() : IndexKey(name); }

template <class Pair>
std::function<bool(ZEBXmlElement&)> MatchedBy(const Pair* pairs, unsigned int count) {
    return [pairs, count](ZEBXmlElement& element) { return element.IsMatched(pairs, count, 0) != 0; };
}

}  // namespace

ZEBXmlElement::ZEBXmlElement() = default;

ZEBXmlElement::ZEBXmlElement(ZEBXmlNode* owner) : ZEBXmlNode(owner) {}

ZEBXmlElement::ZEBXmlElement(UTIL::ITOVXmlDomNode* dom) : ZEBXmlNode(dom) {}

ZEBXmlElement::ZEBXmlElement(const ZEBXmlElement& other) : ZEBXmlNode() { TOVCheck(other.CopyTo(*this)); }

ZEBXmlElement& ZEBXmlElement::operator=(const ZEBXmlElement& other) {
    ZEBXmlNode::operator=(other);
    return *this;
}

TOVRESULT ZEBXmlElement::Load() {
    return TOVGuarded([&] {
        if (m_Status != kStatusNotLoaded) return TOV_OK;
        TOVCheck(ZEBXmlNode::Load());
        RefreshAttributeIndex();
        return TOV_OK;
    });
}

void ZEBXmlElement::OnChanged() {
    RefreshAttributeIndex();
    ZEBXmlNode::OnChanged();
}

TOVRESULT ZEBXmlElement::CopyTo(ZEBXmlNode& target) const {
    return TOVGuarded([&] {
        auto& copy = dynamic_cast<ZEBXmlElement&>(target);
        TOVCheck(ZEBXmlNode::CopyTo(copy));
        CopyStored(copy.m_TagName, m_TagName);
        // A copy that was never loaded indexes its attributes when it loads.
        if (copy.m_Status == kStatusNotLoaded) {
            copy.m_AttributeIndex.clear();
        } else {
            copy.RefreshAttributeIndex();
        }
        return TOV_OK;
    });
}

TOVRESULT ZEBXmlElement::DiscardChanges() {
    return TOVGuarded([&] {
        TOVCheck(ZEBXmlNode::DiscardChanges());
        RefreshAttributeIndex();
        return TOV_OK;
    });
}

TOVRESULT ZEBXmlElement::Save(UTIL::ITOVXmlWriter* writer) {
    return TOVGuarded([&] {
        if (!writer) Throw(TOV_E_INVALIDARG);
        if (m_Status == kStatusDeleted) return TOV_OK;
        const ZEBString tag = GetTagName();
        if (auto* parent = NodeAs<ZEBXmlElement>(m_pOwner)) {
            const ZEBString parentTag = parent->GetTagName();
            TOVCheck(writer->WriteElement(tag.InArg(), parentTag.InArg()));
        } else {
            TOVCheck(writer->WriteElement(tag.InArg(), nullptr));
        }
        std::vector<ZEBXmlAttribute*> attributes;
        TOVCheck(GetAllAttributes(attributes));
        for (ZEBXmlAttribute* attribute : attributes) TOVCheck(attribute->Save(writer));
        std::vector<ZEBXmlNode*> others;
        TOVCheck(GetAllNonAttrChildren(others));
        for (ZEBXmlNode* other : others) TOVCheck(other->Save(writer));
        return TOV_OK;
    });
}

ZEBString ZEBXmlElement::GetTagName() {
    if (IsNew()) return StoredText(m_TagName);
    if (!m_pDom) Throw(ZEB_E_NOTREADY);
    TOVPtr<UTIL::ITOVXmlDomElement> view;
    if (m_pDom->QueryInterface(UTIL::IID_ITOVXmlDomElement, view.Out()) < 0) Throw(TOV_E_UNEXPECTED);
    ITOVString* tag = nullptr;
    TOVCheck((*view).GetTagName(&tag));
    return Adopt(tag);
}

TOVRESULT ZEBXmlElement::SetTagName(const ZEBString& tag) {
    return TOVGuarded([&] {
        if (!IsNew()) Throw(TOV_E_UNEXPECTED);
        CopyStored(m_TagName, tag);
        m_Status = kStatusChanged;
        return TOV_OK;
    });
}

ZEBString ZEBXmlElement::GetText() {
    TOVCheck(Load());
    // The result is UTF-16 in every case. Each piece comes as a string of its
    // own, so the first that is not empty becomes the result, converted in
    // place, and the others are appended to it.
    std::optional<ZEBString> text;
    for (ZEBXmlNode* child : m_Children) {
        const auto* piece = NodeAs<ZEBXmlText>(child);
        if (!piece) continue;
        ZEBString part = piece->GetText();
        if (part.IsEmpty()) continue;
        if (text) {
            *text += part;
        } else {
            part.ConvertTo(kTOVUnicodeUTF16);
            text.emplace(std::move(part));
        }
    }
    if (!text) return EmptyText();
    return std::move(*text);
}

TOVRESULT ZEBXmlElement::SetText(const ZEBString& text) {
    return TOVGuarded([&] {
        TOVCheck(Load());
        std::vector<ZEBXmlNode*> kept;
        for (ZEBXmlNode* child : m_Children) {
            if (auto* piece = NodeAs<ZEBXmlText>(child)) {
                if (piece->IsNew()) {
                    delete piece;
                    continue;
                }
                TOVCheck(piece->Delete());
            }
            kept.push_back(child);
        }
        m_Children.swap(kept);
        return AppendText(text);
    });
}

TOVRESULT ZEBXmlElement::AppendText(const ZEBString& text) {
    return TOVGuarded([&] {
        std::unique_ptr<ZEBXmlText> piece(new ZEBXmlText(text));
        piece->OnChanged();
        TOVCheck(Append(piece.get()));
        piece.release();
        return TOV_OK;
    });
}

template <class Kind>
TOVRESULT ZEBXmlElement::CollectChildren(std::vector<Kind*>& out) {
    return TOVGuarded([&] {
        TOVCheck(Load());
        for (ZEBXmlNode* child : m_Children) {
            if (auto* match = NodeAs<Kind>(child)) out.push_back(match);
        }
        return TOV_OK;
    });
}

TOVRESULT ZEBXmlElement::GetAllTexts(std::vector<ZEBXmlText*>& out) { return CollectChildren(out); }

TOVRESULT ZEBXmlElement::GetAllAttributes(std::vector<ZEBXmlAttribute*>& out) { return CollectChildren(out); }

TOVRESULT ZEBXmlElement::GetAllElements(std::vector<ZEBXmlElement*>& out) { return CollectChildren(out); }

TOVRESULT ZEBXmlElement::GetAllCDATAs(std::vector<ZEBXmlCDATA*>& out) { return CollectChildren(out); }

TOVRESULT ZEBXmlElement::GetAllNonAttrChildren(std::vector<ZEBXmlNode*>& out) {
    return TOVGuarded([&] {
        TOVCheck(Load());
        for (ZEBXmlNode* child : m_Children) {
            if (!NodeAs<ZEBXmlAttribute>(child)) out.push_back(child);
        }
        return TOV_OK;
    });
}

bool ZEBXmlElement::HasAttribute(const ZEBString& name) { return GetAttributeNode(name) != nullptr; }

ZEBXmlAttribute* ZEBXmlElement::GetAttributeNode(const ZEBString& name) {
    TOVCheck(Load());
    if (m_AttributeIndex.empty()) RefreshAttributeIndex();
    if (m_AttributeIndex.empty()) return nullptr;
    const auto found = m_AttributeIndex.find(IndexKey(name));
    if (found == m_AttributeIndex.end()) return nullptr;
    const int32_t position = found->second;
    if (position < 0 || static_cast<size_t>(position) >= m_Children.size()) return nullptr;
    auto* attribute = NodeAs<ZEBXmlAttribute>(m_Children[position]);
    if (!attribute || attribute->GetStatus() == kStatusDeleted) return nullptr;
    return attribute;
}

ZEBString ZEBXmlElement::GetAttribute(const ZEBString& name) {
    ZEBXmlAttribute* attribute = GetAttributeNode(name);
    if (!attribute) Throw(ZEB_E_NOTFOUND);
    return attribute->GetValue();
}

TOVRESULT ZEBXmlElement::SetAttribute(const ZEBString& name, const ZEBString& value) {
    return TOVGuarded([&] {
        // An index left from before a Clear must not be trusted either.
        if (m_AttributeIndex.empty() || m_Status == kStatusNotLoaded) RefreshAttributeIndex();
        const std::string key = IndexKey(name);
        const auto found = m_AttributeIndex.find(key);
        if (found != m_AttributeIndex.end()) {
            const int32_t position = found->second;
            ZEBXmlAttribute* attribute = nullptr;
            if (position >= 0 && static_cast<size_t>(position) < m_Children.size()) {
                attribute = NodeAs<ZEBXmlAttribute>(m_Children[position]);
            }
            if (!attribute) Throw(TOV_E_UNEXPECTED);
            TOVCheck(attribute->SetValue(value));
            return TOV_OK;
        }
        std::unique_ptr<ZEBXmlAttribute> attribute(new ZEBXmlAttribute(static_cast<ZEBXmlNode*>(this)));
        TOVCheck(attribute->SetName(name));
        TOVCheck(attribute->SetValue(value));
        m_Children.push_back(attribute.get());
        attribute.release();
        m_AttributeIndex.emplace(key, static_cast<int32_t>(m_Children.size() - 1));
        OnChanged();
        return TOV_OK;
    });
}

TOVRESULT ZEBXmlElement::DeleteAttribute(const ZEBString& name) {
    return TOVGuarded([&] {
        RefreshAttributeIndex();
        if (m_AttributeIndex.empty()) Throw(ZEB_E_NOTFOUND);
        for (ZEBXmlNode* child : m_Children) {
            auto* attribute = NodeAs<ZEBXmlAttribute>(child);
            if (attribute && attribute->GetStatus() != kStatusDeleted && attribute->GetName() == name) {
                TOVCheck(attribute->Delete());
            }
        }
        OnChanged();
        return TOV_OK;
    });
}

void ZEBXmlElement::RefreshAttributeIndex() {
    if (m_Status == kStatusNotLoaded) Throw(ZEB_E_NOTREADY);
    m_AttributeIndex.clear();
    for (size_t position = 0; position < m_Children.size(); ++position) {
        const auto* attribute = NodeAs<ZEBXmlAttribute>(m_Children[position]);
        if (!attribute || attribute->GetStatus() == kStatusDeleted) continue;
        // emplace keeps the first of two attributes of one name.
        m_AttributeIndex.emplace(IndexKey(attribute->GetName()), static_cast<int32_t>(position));
    }
}

int ZEBXmlElement::IsMatched(const _ZEBXMLATTRPAIR* pairs, unsigned int count, int flag) {
    if (!pairs || count == 0) return 1;
    for (unsigned int i = 0; i < count; ++i) {
        const ZEBXmlAttribute* attribute = GetAttributeNode(ZEBString(pairs[i].name));
        if (!attribute) return 0;
        ZEBString actual = attribute->GetValue();
        ZEBString wanted(pairs[i].value);
        if (flag == 0) {
            actual.ToLower();
            wanted.ToLower();
        }
        if (actual.Compare(wanted.InArg(), 1) != 0) return 0;
    }
    return 1;
}

int ZEBXmlElement::IsMatched(const _ZEBXMLELEMPAIR* pairs, unsigned int count, int flag) {
    if (!pairs || count == 0) return 1;
    for (unsigned int i = 0; i < count; ++i) {
        const ZEBString wanted(pairs[i].value);
        std::vector<ZEBXmlElement*> children;
        TOVCheck(GetElements(ZEBString(pairs[i].name), children));
        for (ZEBXmlElement* child : children) {
            if (child->GetText().Compare(wanted.InArg(), flag) == 0) return 1;
        }
    }
    return 0;
}

bool ZEBXmlElement::HasTag(std::string_view tag) { return TagKey() == tag; }

const std::string& ZEBXmlElement::TagKey() {
    if (IsNew() || !m_HasTagKey) {
        m_TagKey = IndexKey(GetTagName());
        m_HasTagKey = !IsNew();
    }
    return m_TagKey;
}

template <class Visit>
void ZEBXmlElement::VisitElements(std::string_view tag, const Filter& filter, Visit&& visit) {
    TOVCheck(Load());
    for (size_t i = 0; i < m_Children.size(); ++i) {
        auto* element = NodeAs<ZEBXmlElement>(m_Children[i]);
        if (!element) continue;
        if (!tag.empty() && element->TagKey() != tag) continue;
        if (filter && !filter(*element)) continue;
        if (!visit(element)) return;
    }
}

ZEBXmlElement* ZEBXmlElement::NthElement(std::string_view tag, const Filter& filter, unsigned int index) {
    ZEBXmlElement* found = nullptr;
    unsigned int seen = 0;
    VisitElements(tag, filter, [&](ZEBXmlElement* element) {
        if (seen++ != index) return true;
        found = element;
        return false;
    });
    return found;
}

TOVRESULT ZEBXmlElement::CollectElements(const ZEBString& name, const Filter& filter,
                                         std::vector<ZEBXmlElement*>& out) {
    return TOVGuarded([&] {
        VisitElements(WantedTag(name), filter, [&](ZEBXmlElement* element) {
            out.push_back(element);
            return true;
        });
        return TOV_OK;
    });
}

unsigned int ZEBXmlElement::CountElements(std::string_view tag, const Filter& filter) {
    unsigned int count = 0;
    VisitElements(tag, filter, [&](ZEBXmlElement*) {
        ++count;
        return true;
    });
    return count;
}

TOVRESULT ZEBXmlElement::DeleteMatches(const ZEBString& name, const Filter& filter, unsigned int* deleted) {
    return TOVGuarded([&] {
        std::vector<ZEBXmlElement*> matches;
        TOVCheck(CollectElements(name, filter, matches));
        for (ZEBXmlElement* match : matches) {
            if (match->IsNew()) {
                m_Children.erase(std::find(m_Children.begin(), m_Children.end(), match));
                delete match;
            } else {
                TOVCheck(match->Delete());
            }
        }
        // Erasing moves the attributes behind the gap, so the index is made anew.
        if (!matches.empty()) OnChanged();
        if (deleted) *deleted = static_cast<unsigned int>(matches.size());
        return TOV_OK;
    });
}

ZEBXmlElement* ZEBXmlElement::GetElement(const ZEBString& name, unsigned int index) {
    return NthElement(WantedTag(name), Filter(), index);
}

ZEBXmlElement* ZEBXmlElement::GetElement(std::string_view tag, unsigned int index) {
    return NthElement(tag, Filter(), index);
}

ZEBXmlElement* ZEBXmlElement::GetElement(const ZEBString& name, const _ZEBXMLATTRPAIR* pairs, unsigned int count,
                                         unsigned int index) {
    return NthElement(WantedTag(name), MatchedBy(pairs, count), index);
}

ZEBXmlElement* ZEBXmlElement::GetElement(const ZEBString& name, const _ZEBXMLELEMPAIR* pairs, unsigned int count,
                                         unsigned int index) {
    return NthElement(WantedTag(name), MatchedBy(pairs, count), index);
}

TOVRESULT ZEBXmlElement::GetElements(const ZEBString& name, std::vector<ZEBXmlElement*>& out) {
    return CollectElements(name, Filter(), out);
}

TOVRESULT ZEBXmlElement::GetElements(const ZEBString& name, const _ZEBXMLATTRPAIR* pairs, unsigned int count,
                                     std::vector<ZEBXmlElement*>& out) {
    return CollectElements(name, MatchedBy(pairs, count), out);
}

TOVRESULT ZEBXmlElement::GetElements(const ZEBString& name, const _ZEBXMLELEMPAIR* pairs, unsigned int count,
                                     std::vector<ZEBXmlElement*>& out) {
    return CollectElements(name, MatchedBy(pairs, count), out);
}

unsigned int ZEBXmlElement::CountElement(const ZEBString& name) { return CountElements(WantedTag(name), Filter()); }

unsigned int ZEBXmlElement::CountElement(const ZEBString& name, const _ZEBXMLATTRPAIR* pairs, unsigned int count) {
    return CountElements(WantedTag(name), MatchedBy(pairs, count));
}

unsigned int ZEBXmlElement::CountElement(const ZEBString& name, const _ZEBXMLELEMPAIR* pairs, unsigned int count) {
    return CountElements(WantedTag(name), MatchedBy(pairs, count));
}

TOVRESULT ZEBXmlElement::DeleteElements(const ZEBString& name, unsigned int&) {
    return DeleteMatches(name, Filter(), nullptr);
}

TOVRESULT ZEBXmlElement::DeleteElements(const ZEBString& name, const _ZEBXMLATTRPAIR* pairs, unsigned int count,
                                        unsigned int& deleted) {
    return DeleteMatches(name, MatchedBy(pairs, count), &deleted);
}

TOVRESULT ZEBXmlElement::DeleteElements(const ZEBString& name, const _ZEBXMLELEMPAIR* pairs, unsigned int count,
                                        unsigned int& deleted) {
    return DeleteMatches(name, MatchedBy(pairs, count), &deleted);
}

TOVRESULT ZEBXmlElement::AddElement(const ZEBString& name, ZEBXmlElement** added) {
    return AddNewElement(name, nullptr, added);
}

TOVRESULT ZEBXmlElement::AddElement(const ZEBString& name, const ZEBString& text, ZEBXmlElement** added) {
    return AddNewElement(name, &text, added);
}

TOVRESULT ZEBXmlElement::AddNewElement(const ZEBString& name, const ZEBString* text, ZEBXmlElement** added) {
    return TOVGuarded([&] {
        std::unique_ptr<ZEBXmlElement> element(new ZEBXmlElement());
        TOVCheck(element->SetTagName(name));
        TOVCheck(Append(element.get()));
        ZEBXmlElement* const kept = element.release();
        if (added) *added = kept;
        if (text) TOVCheck(kept->SetText(*text));
        return TOV_OK;
    });
}

}  // namespace XMLUtils
}  // namespace ZEB
