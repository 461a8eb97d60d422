// Large, deep and hostile input.

#include "unit/xml-events.h"

#include "spec/zel-svc-xml-block.h"

#include <array>
#include <gtest/gtest.h>
#include <pthread.h>
#include <random>

using zel_test::parse_xml;

namespace {

struct Counts {
    std::size_t starts = 0;
    std::size_t ends = 0;
    std::size_t text_bytes = 0;
};
Counts gCounts;

ZelSvcXmlResult count_events(const std::string &bytes) {
    static constexpr ZelSvcXmlCallbacks callbacks{
        .start_element =
            [](std::uint32_t, const char *, std::int32_t, const ZelSvcXmlAttribute *) {
                ++gCounts.starts;
                return 0;
            },
        .end_element =
            [](std::uint32_t, const char *) {
                ++gCounts.ends;
                return 0;
            },
        .text =
            [](std::uint32_t, const char *, std::int32_t size) {
                gCounts.text_bytes += static_cast<std::size_t>(size) - 1;
                return 0;
            },
    };
    gCounts = {};
    ZelSvcXmlParser *parser = zel_svc_xml_parser_create(&callbacks, 0);
    const auto result = zel_svc_xml_parse(parser, bytes.data(), static_cast<std::int32_t>(bytes.size()));
    zel_svc_xml_parser_destroy(parser);
    return result;
}

struct Job {
    std::string bytes;
    ZelSvcXmlResult result = ZEL_SVC_XML_OK;
};

void *run_job(void *argument) {
    Job &job = *static_cast<Job *>(argument);
    job.result = count_events(job.bytes);
    return nullptr;
}

// Parses on a stack that a reader with a frame for every level could not do with.
ZelSvcXmlResult count_on_small_stack(std::string bytes) {
    Job job{std::move(bytes)};
    pthread_attr_t attributes;
    pthread_attr_init(&attributes);
    EXPECT_EQ(pthread_attr_setstacksize(&attributes, std::size_t{128} * 1024), 0);
    pthread_t thread = {};
    EXPECT_EQ(pthread_create(&thread, &attributes, run_job, &job), 0);
    pthread_join(thread, nullptr);
    pthread_attr_destroy(&attributes);
    return job.result;
}

std::string repeated(const std::string &text, std::size_t count) {
    std::string all;
    all.reserve(text.size() * count);
    for (std::size_t at = 0; at < count; ++at)
        all += text;
    return all;
}

} // namespace

TEST(XmlLimits, MillionOpenTagsNeedNoStack) {
    EXPECT_EQ(count_on_small_stack(repeated("<a>", 1'000'000)), ZEL_SVC_XML_ERR_EOF);
    EXPECT_EQ(gCounts.starts, 1'000'000U);
    EXPECT_EQ(gCounts.ends, 0U);
}

TEST(XmlLimits, MillionNestedElementsCloseAgain) {
    EXPECT_EQ(count_on_small_stack(repeated("<a>", 1'000'000) + repeated("</a>", 1'000'000)), ZEL_SVC_XML_OK);
    EXPECT_EQ(gCounts.starts, 1'000'000U);
    EXPECT_EQ(gCounts.ends, 1'000'000U);
}

TEST(XmlLimits, LargeFileIsReadToItsEnd) {
    const std::string record = "<Profile><APN>internet.example</APN><Auth/></Profile>\n";
    const std::size_t count = 64UL * 1024 * 1024 / record.size() + 1;
    EXPECT_EQ(count_events("<r>" + repeated(record, count) + "</r>"), ZEL_SVC_XML_OK);
    EXPECT_EQ(gCounts.starts, 1 + 3 * count);
    EXPECT_EQ(gCounts.text_bytes, 16 * count);
}

TEST(XmlLimits, OneLargeTextIsPassedWhole) {
    EXPECT_EQ(count_events("<r>" + std::string(64UL * 1024 * 1024, 'x') + "</r>"), ZEL_SVC_XML_OK);
    EXPECT_EQ(gCounts.text_bytes, 64UL * 1024 * 1024);
}

TEST(XmlLimits, EveryLengthOfAFileEndsInsideItsMemory) {
    // The copy that is parsed ends with its allocation, so a sanitizer build sees a byte read behind it.
    const std::string whole = "<?xml version=\"1.0\"?>\n<SomewhatLongElementName attribute=\"and a long value &lt;\">\n"
                              "      <Child>and a text that is longer than a block &amp; more</Child>\n"
                              "                                                   <Empty/></Other >";
    ASSERT_EQ(parse_xml(whole).result, ZEL_SVC_XML_OK);
    for (std::size_t length = 0; length < whole.size(); ++length)
        ASSERT_EQ(parse_xml(whole.substr(0, length)).result, ZEL_SVC_XML_ERR_EOF) << length;
}

TEST(XmlLimits, RandomBytesEndInSomeResult) {
    std::mt19937 random{20260101};
    const std::string alphabet = std::string("<>/!?-[]=\"'& \n\tax&lt;") + '\0' + '\xFF';
    for (int round = 0; round < 20000; ++round) {
        std::string bytes = round % 2 == 0 ? "<a>" : "";
        const std::size_t length = random() % 120;
        for (std::size_t at = 0; at < length; ++at)
            bytes += alphabet[random() % alphabet.size()];
        const auto parse = parse_xml(bytes);
        ASSERT_TRUE(parse.result == ZEL_SVC_XML_OK || parse.result == ZEL_SVC_XML_ERR_SYNTAX ||
                    parse.result == ZEL_SVC_XML_ERR_EOF);
        ASSERT_LE(parse.position, static_cast<std::int32_t>(bytes.size()));
        ASSERT_EQ(parse.events.back() == "finish", parse.result == ZEL_SVC_XML_OK);
    }
}

TEST(XmlLimits, ParserWithoutCallbacksOrCursorRefuses) {
    ZelSvcXmlParser *parser = zel_svc_xml_parser_create(nullptr, 0);
    EXPECT_EQ(zel_svc_xml_parse(parser, "<a/>", 4), ZEL_SVC_XML_ERR_SYNTAX);
    zel_svc_xml_parser_destroy(parser);
    ZelSvcXmlParser without_cursor{nullptr, &zel_test::recording_callbacks(), 0, 0};
    EXPECT_EQ(zel_svc_xml_parse(&without_cursor, "<a/>", 4), ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(zel_svc_xml_parse(nullptr, "<a/>", 4), ZEL_SVC_XML_ERR_SYNTAX);
    zel_svc_xml_parser_destroy(nullptr);
}

TEST(XmlLimits, MissingCallbacksDropTheirItems) {
    static constexpr ZelSvcXmlCallbacks none{};
    ZelSvcXmlParser *parser = zel_svc_xml_parser_create(&none, 0);
    const std::string text = "<?xml version=\"1\"?><!DOCTYPE d e><?p d?><!--c--><a b=\"1\">t<![CDATA[d]]><c/></a>";
    EXPECT_EQ(zel_svc_xml_parse(parser, text.data(), static_cast<std::int32_t>(text.size())), ZEL_SVC_XML_OK);
    zel_svc_xml_parser_destroy(parser);
}

TEST(XmlLimits, NoBytesAreAnEmptyInput) {
    ZelSvcXmlParser *parser = zel_svc_xml_parser_create(&zel_test::recording_callbacks(), 77);
    EXPECT_EQ(zel_svc_xml_parse(parser, nullptr, 5), ZEL_SVC_XML_ERR_EOF);
    EXPECT_EQ(zel_svc_xml_parse(parser, "<a/>", -1), ZEL_SVC_XML_ERR_EOF);
    zel_svc_xml_parser_destroy(parser);
}

TEST(XmlLimits, ParserParsesAgain) {
    ZelSvcXmlParser *parser = zel_svc_xml_parser_create(&zel_test::recording_callbacks(), 77);
    EXPECT_EQ(zel_svc_xml_parse(parser, "<a><", 4), ZEL_SVC_XML_ERR_EOF);
    EXPECT_EQ(zel_svc_xml_parse(parser, "<a/>", 4), ZEL_SVC_XML_OK);
    zel_svc_xml_parser_destroy(parser);
}

TEST(XmlBlock, MasksTellEveryByteOnAnyProcessor) {
    for (int value = 0; value < 256; ++value)
        for (unsigned place = 0; place < ZEL_SVC_XML_BLOCK_SIZE; ++place) {
            std::array<char, ZEL_SVC_XML_BLOCK_SIZE> bytes;
            bytes.fill('z');
            bytes[place] = static_cast<char>(value);
            const ZelSvcXmlBlock block{bytes.data()};
            const std::uint32_t equal = value == '<' ? 1U << place : 0U;
            const std::uint32_t at_most = value <= ' ' ? 1U << place : 0U;
            ASSERT_EQ(zel_svc_xml_mask(block.equal('<')), equal) << value;
            ASSERT_EQ(zel_svc_xml_portable_mask(block.equal('<')), equal) << value;
            ASSERT_EQ(zel_svc_xml_mask(block.at_most(' ')), at_most) << value;
            ASSERT_EQ(zel_svc_xml_portable_mask(block.at_most(' ')), at_most) << value;
            ASSERT_EQ(zel_svc_xml_mask(block.equal('<') | block.at_most(' ')), equal | at_most) << value;
        }
}
