// The bytes of an export, and what becomes of them when memory runs out.

#include "spec/zel-svc-encode-text.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>

namespace {

int gAllocations = 0;
int gAllowed = 0;

void *allocate_a_few(std::size_t count, std::size_t size) {
    return gAllocations++ < gAllowed ? std::calloc(count, size) : nullptr;
}

using Released = std::unique_ptr<char, decltype(&std::free)>;

} // namespace

TEST(EncodeText, KeepsWhatIsPut) {
    ZelSvcEncodeText text;
    EXPECT_EQ(text.view(), "");
    text.put("one ");
    text.put("");
    text.put(std::string_view("t\0o", 3));
    EXPECT_EQ(text.view(), std::string_view("one t\0o", 7));
    EXPECT_TRUE(text.is_whole());
}

TEST(EncodeText, ReleasesATerminatedTextAndIsEmptyThen) {
    ZelSvcEncodeText text;
    text.put("document");
    const Released released{text.release(), &std::free};
    EXPECT_STREQ(released.get(), "document");
    EXPECT_EQ(text.view(), "");
    text.put("next");
    EXPECT_EQ(text.view(), "next");
}

TEST(EncodeText, OfNothingIsAnEmptyText) {
    ZelSvcEncodeText text;
    const Released released{text.release(), &std::free};
    EXPECT_STREQ(released.get(), "");
}

TEST(EncodeText, DropsWhatComesBehindAFailedAllocation) {
    for (gAllowed = 0; gAllowed < 5; ++gAllowed) {
        gAllocations = 0;
        ZelSvcEncodeText text{allocate_a_few};
        std::string whole;
        while (text.is_whole()) {
            const std::string piece(1 + whole.size(), 'x');
            text.put(piece);
            if (text.is_whole()) whole += piece;
        }
        EXPECT_EQ(text.view(), whole) << "what was there stays as it was";
        text.put("y");
        EXPECT_EQ(text.view(), whole) << "though there may be room for one byte";
        EXPECT_EQ(text.release(), nullptr) << "half a document is none";
    }
}

TEST(EncodeText, WhoseRestIsDroppedIsNone) {
    ZelSvcEncodeText text;
    text.put("one");
    text.drop_rest();
    text.put("two");
    EXPECT_EQ(text.view(), "one");
    EXPECT_FALSE(text.is_whole());
    EXPECT_EQ(text.release(), nullptr);
}

TEST(EncodeText, WithoutRoomForTheTerminatorIsNone) {
    gAllocations = 0;
    gAllowed = 1;
    ZelSvcEncodeText text{allocate_a_few};
    text.put("12345678");
    EXPECT_TRUE(text.is_whole());
    EXPECT_EQ(text.release(), nullptr);
}

TEST(EncodeText, AllocatesSeldom) {
    gAllocations = 0;
    gAllowed = 1000;
    ZelSvcEncodeText text{allocate_a_few};
    for (int i = 0; i < 100000; ++i)
        text.put("0123456789");
    EXPECT_EQ(text.view().size(), 1000000U);
    EXPECT_LT(gAllocations, 30);
}
