// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/MessageMask.h"

#include "LogMessages/LogMessage.h"
#include "LogMessages/RecordTime.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Export/Masking/ExampleKey.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

class MessageMaskTest : public testing::Test {
protected:
    MessageMaskTest() {
        for (const DecodedTechnology& each : decodedTechnologies)
            if (const std::string resource = each.resource; !resource.empty())
                _resources.put(resource, "plist", shippedResource(resource + ".plist"));
    }

    /// What the message becomes, as bytes.
    Data masked(const Data& message, const char* technology, MaskOptions options = exampleOptions()) {
        MessageMask mask(options);
        LoggedMessage logged;
        logged.message = message;
        const std::optional<LoggedMessage> result = mask.mask(logged, technology);
        _report = mask.report();
        return result ? result->message : Data();
    }
    Data masked(const Data& message, const char* technology, MaskLevel level) {
        return masked(message, technology, exampleOptions(level));
    }

    CapturedLog _log{LogPriority::Emergency};
    FakeResources _resources;
    MaskReport _report;
};

TEST_F(MessageMaskTest, ServingNetworkIsMaskedInItsDigits) {
    const Data message = record(0x7135, "02 03 "    // operating mode and service type
                                        "00 F1 10 " // 001-01
                                        "10 05 0B " // LAC 4101, RAC 11
                                        "55 "       // of which no field is read
                                        "00 00 00 00 00 00 00 00 00 00");
    EXPECT_EQ(masked(message, "Ostrel_GSM"),
              record(0x7135, "02 03 00 F1 10 10 05 0B 00 00 00 00 00 00 00 00 00 00 00"));
    // 001-01 becomes 078-07, LAC 4101 0xAD6A, RAC 11 220.
    EXPECT_EQ(masked(message, "Ostrel_GSM", MaskLevel::Location),
              record(0x7135, "02 03 70 F8 70 AD 6A DC 00 00 00 00 00 00 00 00 00 00 00"));
    EXPECT_EQ(_report.of(Masked::Location), 3U);
    EXPECT_EQ(_report.of(Masked::UnknownBytes), 1U);
}

TEST_F(MessageMaskTest, TemporaryIdentityIsMasked) {
    std::vector<std::uint8_t> payload(37);
    payload[25] = 0xE8; // the UATI, at 38 of the record
    payload[26] = 0xC7;
    payload[27] = 0x8E;
    const Data message = recordOf(0x1183, payload);
    const Data result = masked(message, "Ostrel_CDMA");
    payload[25] = 0x28;
    payload[26] = 0x7D;
    payload[27] = 0x34;
    EXPECT_EQ(result, recordOf(0x1183, payload));
    EXPECT_EQ(_report.of(Masked::Subscriber), 1U);
}

TEST_F(MessageMaskTest, ListThatTheRecordEndsWithinIsRemoved) {
    const Data message = record(0x12B6, "00 00 "                      // 13
                                        "02 "                         // two pilots, of which one is there
                                        "00 00 00 00 00 00 00 00 00 " // of which no field is read
                                        "38 39 34 39 30 32 30 30 30 30 30 31 "
                                        "39 30");
    EXPECT_EQ(masked(message, "Ostrel_CDMA"), record(0x12B6, "00 00 02 00 00 00 00 00 00 00 00 00 "
                                                             "00 00 00 00 00 00 00 00 00 00 00 00 00 00"));
    EXPECT_EQ(_report.of(Masked::UnknownBytes), 14U);
}

TEST_F(MessageMaskTest, EntryThatTheRecordEndsWithinIsRemoved) {
    const Data message = record(0x51FF, "00 02 "       // two BSICs
                                        "28 00 0B 00 " // ARFCN 40
                                        "39 30 31");
    EXPECT_EQ(masked(message, "Ostrel_GSM"), record(0x51FF, "00 02 28 00 0B 00 00 00 00"));
}

TEST_F(MessageMaskTest, CellsOfRecordsAndListsHaveTheSamePseudonyms) {
    std::vector<std::uint8_t> payload(25);
    payload[9] = 0x03; // cell identity 0x1234503, at 22
    payload[10] = 0x45;
    payload[11] = 0x23;
    payload[12] = 0x01;
    const Data result = masked(recordOf(0xB0C2, payload), "Ostrel_LTE", MaskLevel::Location);
    EXPECT_EQ(Data::copyOf(result.bytes().subspan(22, 4)), hex("96 EA 88 0A"));
}

TEST_F(MessageMaskTest, UnknownCodeLosesItsPayload) {
    EXPECT_EQ(masked(record(0x1375, "01 02 03"), "Ostrel_GSM"), record(0x1375, "00 00 00"));
    EXPECT_EQ(_report.of(Masked::UnknownCode), 1U);
    EXPECT_EQ(_report.unknownCodes.at(0x1375), 1U);
    // Another technology's code is not known either.
    EXPECT_EQ(masked(record(0xB0C2, "01 02 03"), "Ostrel_GSM"), record(0xB0C2, "00 00 00"));
}

TEST_F(MessageMaskTest, UnknownCodeMayBeKept) {
    MaskOptions options = exampleOptions();
    options.keepsUnknown = true;
    EXPECT_EQ(masked(record(0x1375, "01 02 03"), "Ostrel_GSM", options), record(0x1375, "01 02 03"));
}

TEST_F(MessageMaskTest, MalformedMessagesBecomeZeros) {
    EXPECT_EQ(masked(hex("01 0F 00 35 71"), "Ostrel_GSM"), hex("00 00 00 00 00"));
    EXPECT_EQ(_report.of(Masked::Malformed), 1U);
    // Of an unknown type, with a header that is one apart from that, and without: its length is not 2.
    EXPECT_EQ(masked(record(0x7135, "01 02", 2), "Ostrel_GSM"), record(0x7135, "00 00", 2));
    EXPECT_EQ(masked(hex("02 0200 3571 0000000000000000 0102"), "Ostrel_GSM"),
              hex("02 0000 0000 0000000000000000 0000"));
    // A record that ends within its time stamp.
    EXPECT_EQ(masked(hex("81 00 01 0A 00 35 71 01 02 03 04 05 06"), "Ostrel_GSM"),
              hex("00 00 00 00 00 00 00 00 00 00 00 00 00"));
}

TEST_F(MessageMaskTest, IdentityInATruncatedRecordDoesNotStay) {
    // The location area ends with the record.
    const Data result = masked(record(0x7135, "02 03 00 F1 10 10"), "Ostrel_GSM", MaskLevel::Location);
    EXPECT_EQ(result, record(0x7135, "02 03 70 F8 70 00"));
}

TEST_F(MessageMaskTest, PrefixStays) {
    const Data message = joined(hex("81 00"), record(0x1375, "01 02 03"));
    EXPECT_EQ(masked(message, "Ostrel_GSM"), joined(hex("81 00"), record(0x1375, "00 00 00")));
}

TEST_F(MessageMaskTest, LengthFieldFollowsAListThatBecomesLonger) {
    const auto contexts = makeArray();
    const auto context = makeDictionary();
    context->set("PDP Address", "10.6.3.7");
    contexts->append(Value(context));
    const Data result = masked(extraRecord(2, Value(contexts)), "Ostrel_GSM");
    const std::optional<LogMessage> message = LogMessage::parse(result.bytes());
    ASSERT_TRUE(message);
    EXPECT_EQ(message->length(), result.size() - 1);
    const Result<Value> list = readPropertyList(message->payload());
    ASSERT_TRUE(list);
    EXPECT_TRUE(
        isDocumentationAddress(*(*list->asArray())[0].asDictionary()->find("PDP Address")->asString()));
}

TEST_F(MessageMaskTest, PropertyListsKeepTheirForm) {
    const auto files = makeDictionary();
    files->set("kSimFile_ICCID", "8900101000000000017");
    const auto binary = *writeBinaryPropertyList(Value(files));
    EXPECT_TRUE(readBinaryPropertyList(masked(recordOf(0, binary, 0xFF), "Ostrel_GSM").bytes().subspan(13),
                                       messageLimits));
    const auto text = *writeXMLPropertyList(Value(files));
    const Data xml =
        recordOf(0, Bytes(reinterpret_cast<const std::uint8_t*>(text.data()), text.size()), 0xFF);
    EXPECT_TRUE(readXMLPropertyList(masked(xml, "Ostrel_GSM").bytes().subspan(13), messageLimits));
    EXPECT_EQ(masked(xml, "Ostrel_GSM").size(), xml.size());
}

TEST_F(MessageMaskTest, UnreadableListBecomesZeros) {
    EXPECT_EQ(masked(recordOf(0, hex("62 70 6C 69 73 74").bytes(), 0xFF), "Ostrel_GSM"),
              recordOf(0, hex("00 00 00 00 00 00").bytes(), 0xFF));
    EXPECT_EQ(masked(hex("31 32 33"), "IFX"), hex("00 00 00"));
}

TEST_F(MessageMaskTest, UnknownTechnologyIsLeftOut) {
    EXPECT_EQ(masked(record(0x7135, "00"), "Ostrel_Other"), Data());
    EXPECT_EQ(_report.leftOut, 1U);
}

TEST_F(MessageMaskTest, TimesMoveToTheEpoch) {
    using namespace std::chrono;
    MessageMask mask(exampleOptions(MaskLevel::All));
    const Time first = sys_days(year(2026) / 1 / 5) + 8h;
    const auto recordAt = [](Time time) {
        const auto header = LogMessage::header(1, 0x1375, 0, recordTimestamp(time));
        return Data::copyOf(header);
    };
    LoggedMessage message;
    message.time = first;
    message.message = recordAt(first - 25ms);
    const auto one = mask.mask(message, "Ostrel_GSM");
    message.time = first + 90s;
    message.refresh = first + 91s;
    message.message = recordAt(first + 89s);
    const auto other = mask.mask(message, "Ostrel_GSM");
    ASSERT_TRUE(one && other);
    const Time epoch = sys_days(year(2000) / 1 / 1);
    EXPECT_EQ(one->time, epoch);
    EXPECT_EQ(other->time, epoch + 90s);
    EXPECT_EQ(*other->refresh, epoch + 91s);
    EXPECT_EQ(timeOfRecord(*LogMessage::parse(one->message.bytes())->timestamp()), epoch - 25ms);
    EXPECT_EQ(timeOfRecord(*LogMessage::parse(other->message.bytes())->timestamp()), epoch + 89s);
}

TEST_F(MessageMaskTest, ListThatWouldGrowWithoutLimitIsEmptied) {
    // Compact XML, of which the writer makes a line and tabs an element.
    std::string text = "<dict>";
    for (int i = 0; i < 500; ++i)
        text += "<key>k</key><true/>";
    text += "<key>kSimFile_ICCID</key><array>";
    for (int i = 0; i < 60; ++i)
        text += "<array>";
    for (int i = 0; i < 400; ++i)
        text += "<string>1</string>";
    for (int i = 0; i < 60; ++i)
        text += "</array>";
    text += "</array></dict>";
    const Data message =
        recordOf(0, Bytes(reinterpret_cast<const std::uint8_t*>(text.data()), text.size()), 0xFF);
    const Data result = masked(message, "Ostrel_GSM");
    EXPECT_LE(result.size(), 2 * message.size());
    const Result<Value> list = readPropertyList(result.bytes().subspan(13));
    ASSERT_TRUE(list);
    EXPECT_TRUE(list->asDictionary()->empty());
}

} // namespace
} // namespace velmora
