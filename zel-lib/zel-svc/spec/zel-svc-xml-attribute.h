#pragma once
// The attributes of a start tag, in document order.

struct ZelSvcXmlAttribute {
    const ZelSvcXmlAttribute *next;
    const char *name;
    const char *value; // entity-decoded
};
