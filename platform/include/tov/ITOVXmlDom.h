#pragma once
/// The host's XML document object model: nodes, their attribute lists, and the
/// element and attribute views reached by QueryInterface from a node.
/// Every "out" receives one counted reference; strings handed out are owned
/// by the caller.
#include <cstdint>

#include "tov/ITOVString.h"
#include "tov/ITOVUnknown.h"

namespace UTIL {

inline constexpr _tovUID IID_ITOVXmlDomNode = {
    0xEE7F1BE7, 0xCEF3, 0x4EE9, {0xB6, 0x8A, 0xED, 0x96, 0xD4, 0x84, 0xEE, 0xAB}};
inline constexpr _tovUID IID_ITOVXmlDomElement = {
    0x9A93A6D5, 0x798D, 0x43F5, {0xAD, 0xA1, 0xF1, 0x8A, 0x6D, 0x07, 0x45, 0x4E}};
inline constexpr _tovUID IID_ITOVXmlDomAttribute = {
    0x72AF0713, 0x70D9, 0x4992, {0xB3, 0xC7, 0xE8, 0x3F, 0xFE, 0x18, 0xEB, 0xB7}};
inline constexpr _tovUID IID_ITOVXmlDomNodeList = {
    0x6B1E4C1D, 0x2F0A, 0x4B7E, {0x9C, 0x3D, 0x51, 0x7A, 0x0E, 0x84, 0xC2, 0x19}};

/// Node types as the DOM reports them.
enum TOVXmlNodeType : int32_t {
    kTOVXmlElement = 1,
    kTOVXmlAttribute = 2,
    kTOVXmlText = 3,
    kTOVXmlCDATA = 4,
    kTOVXmlEntityReference = 5,
    kTOVXmlProcessingInstruction = 7,
    kTOVXmlComment = 8,
};

class ITOVXmlDomNodeList;

class ITOVXmlDomNode : public ITOVUnknown {
public:
    /// 1 when the node is an element with at least one attribute.
    virtual int HasAttributes() = 0;
    virtual int32_t GetNodeType() = 0;
    /// Element and attribute: the qualified name; text "#text", CDATA
    /// "#cdata-section", comment "#comment", processing instruction its target.
    virtual TOVRESULT GetName(ITOVString** out) = 0;
    /// Attribute: its value; text, CDATA, comment: the text; element: empty.
    virtual TOVRESULT GetValue(ITOVString** out) = 0;
    /// Attributes are not children.
    virtual uint32_t GetChildCount() = 0;
    /// TOV_E_OUTOFRANGE beyond the count.
    virtual TOVRESULT GetChild(uint32_t index, ITOVXmlDomNode** out) = 0;
    /// The attributes in document order; an empty list for nodes without.
    virtual TOVRESULT GetAttributes(ITOVXmlDomNodeList** out) = 0;

protected:
    ~ITOVXmlDomNode() = default;
};

class ITOVXmlDomNodeList : public ITOVUnknown {
public:
    virtual uint32_t GetCount() = 0;
    /// TOV_E_OUTOFRANGE beyond the count.
    virtual TOVRESULT GetItem(uint32_t index, ITOVXmlDomNode** out) = 0;

protected:
    ~ITOVXmlDomNodeList() = default;
};

class ITOVXmlDomElement : public ITOVXmlDomNode {
public:
    virtual TOVRESULT GetTagName(ITOVString** out) = 0;

protected:
    ~ITOVXmlDomElement() = default;
};

class ITOVXmlDomAttribute : public ITOVXmlDomNode {
public:
    virtual TOVRESULT GetAttributeName(ITOVString** out) = 0;
    virtual TOVRESULT GetAttributeValue(ITOVString** out) = 0;

protected:
    ~ITOVXmlDomAttribute() = default;
};

}  // namespace UTIL
