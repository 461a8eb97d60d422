#pragma once
// Elements of the element table, written into a document with the values that their own handlers give out.
//
//     ZelSvcEncodeWriter writer{text};
//     writer.header();
//     writer.open(ZEL_SVC_ELEMENT_CUSTOMER_DATA);      // <CustomerData>
//     writer.leaf(ZEL_SVC_ELEMENT_SALES_CODE);         //   <SalesCode>XFV</SalesCode>
//     writer.close(ZEL_SVC_ELEMENT_CUSTOMER_DATA);     // </CustomerData>
//
// Handlers run in the encode action, which the caller has set, and see the element on top of the open ones.

#include "spec/zel-svc-encode-text.h"
#include "spec/zel-svc-occurrence.h"

class ZelSvcEncodeWriter {
  public:
    explicit ZelSvcEncodeWriter(ZelSvcEncodeText &text) : text_(text) {}

    // The byte-order mark and the XML declaration.
    void header();

    // A container's tags, each on a line of its own; what comes between them is indented.
    void open(ZelSvcElementId id);
    void close(ZelSvcElementId id);

    // An element without children, on one line.
    void leaf(ZelSvcElementId id);
    // The same for an element that has no value.
    void empty_leaf(ZelSvcElementId id);

  private:
    void indent();
    void start_element(ZelSvcElementId id);
    void value(ZelSvcElementId id);
    void end_element(ZelSvcElementId id);

    ZelSvcEncodeText &text_;
    std::size_t indentation_ = 0;
};

// The value of an element, which is not written anywhere. std::bad_alloc when its handler had no memory.
ZelSvcExportText zel_svc_encode_query(ZelSvcElementId id);
