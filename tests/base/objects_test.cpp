#include <gtest/gtest.h>

#include "platform/base/values.h"

namespace {

std::size_t alive(base::Kind kind) { return base::aliveByKind().at(static_cast<std::size_t>(kind)); }
HostStringRef text(const char* value) { return HostGetConstantString(value); }

TEST(Objects, ConstantStringsAreOneObjectForOneTextAndNeverEnd) {
  const HostStringRef name = text("com.tarn.kvd");
  HostRelease(name);
  HostRelease(name);
  EXPECT_EQ(text("com.tarn.kvd"), name);
  EXPECT_EQ(alive(base::Kind::String), 0u);
}

TEST(Objects, ContainersGiveBackWhatTheyHold) {
  auto* inner = new base::List({new base::String("a"), new base::Number(true)});
  auto* outer = new base::Dictionary({{"items", inner}});
  EXPECT_EQ(HostDictionaryGetValue(HostDictionaryRef(outer), text("items")), inner);
  EXPECT_EQ(HostDictionaryGetValue(HostDictionaryRef(outer), text("Items")), nullptr);
  EXPECT_EQ(HostListGetItem(HostListRef(inner), 2), nullptr);
  EXPECT_FALSE(HostAsString(inner->items[1]));
  const auto kept = base::retained(inner->items[0]);
  HostRelease(outer);
  EXPECT_EQ(alive(base::Kind::List) + alive(base::Kind::Dictionary) + alive(base::Kind::Number), 0u);
  EXPECT_EQ(alive(base::Kind::String), 1u);
}

TEST(Objects, ScopesNestAndClosingOneClosesThoseInside) {
  HostCloseReleaseScope(nullptr);
  const HostReleaseScopeRef outer = HostOpenReleaseScope();
  HostCreateStringFromUTF8("outer");
  const HostReleaseScopeRef inner = HostOpenReleaseScope();
  const HostStringRef kept = HostCreateStringFromUTF8("inner");
  HostRetain(kept);
  HostCloseReleaseScope(outer);
  EXPECT_EQ(base::openScopes(), 0u);
  EXPECT_EQ(alive(base::Kind::String), 1u);
  HostCloseReleaseScope(inner);
  HostCloseReleaseScope(outer);
  HostRelease(kept);
  EXPECT_EQ(alive(base::Kind::String) + alive(base::Kind::ReleaseScope), 0u);
}

TEST(Strings, OnlyUTF8BecomesAString) {
  EXPECT_EQ(base::textOf(HostCreateStringFromUTF8("\xE2\x82\xAC")), "€");
  EXPECT_FALSE(HostCreateStringFromUTF8("a\x80"));
}

TEST(Strings, SplitAtEverySeparator) {
  const char* const cases[][3] = {{"8.1.2", ".", "8|1|2|"}, {"7", ".", "7|"},     {"", ".", "|"},
                                  {".a.", ".", "|a||"},     {"aaa", "aa", "|a|"}, {"a.b", "", "a.b|"}};
  for (const auto& [whole, separator, pieces] : cases) {
    const HostListRef list = HostCreateListBySeparatingString(text(whole), text(separator));
    std::string joined;
    for (std::size_t i = 0; i < HostListGetCount(list); ++i) {
      joined += base::textOf(HostAsString(HostListGetItem(list, i))) + "|";
    }
    EXPECT_EQ(joined, pieces) << whole;
    HostRelease(list);
  }
  EXPECT_FALSE(HostCreateListBySeparatingString(nullptr, text(".")));
}

TEST(Strings, LeadingInteger) {
  const std::pair<const char*, std::int32_t> cases[] = {
      {"9.1", 9}, {" \t-12x", -12},          {"", 0},
      {"- 1", 0}, {"2147483648", INT32_MAX}, {"-99999999999999999999", INT32_MIN}};
  for (const auto& [string, value] : cases) EXPECT_EQ(HostStringIntegerValue(text(string)), value) << string;
}

TEST(Values, SerialNumbersAndEvents) {
  const base::Owned<base::SerialNumber> number(new base::SerialNumber({.high = 1, .low = 2}));
  std::uint32_t parts[2] = {};
  EXPECT_EQ(HostExtractSerialNumberParts(HostSerialNumberRef(number.get()), &parts[0], &parts[1]), 1u);
  EXPECT_EQ(parts[0] * 10 + parts[1], 12u);
  HostEventDescriptor target;
  HostEventDescriptor event;
  EXPECT_NE(HostCreateEvent(1, 2, &target, -1, 0, &event), 0);
  ASSERT_EQ(HostCreateDescriptor(7, parts, sizeof parts, &target), 0);
  ASSERT_EQ(HostCreateEvent(1, 2, &target, -1, 0, &event), 0);
  EXPECT_EQ(base::as<base::EventContents>(event.contents)->data.size(), 8u);
  EXPECT_GT(base::as<base::EventContents>(event.contents)->returnID, 0);
  for (auto* used : {&target, &event, &event}) EXPECT_EQ(HostDisposeDescriptor(used), 0);
  EXPECT_EQ(alive(base::Kind::EventContents), 0u);
}

}  // namespace
