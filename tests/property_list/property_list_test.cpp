#include <gtest/gtest.h>

#include <fstream>
#include <sstream>

#include "platform/base/values.h"
#include "tests/temporary_directory.h"

namespace {

std::string problem;

base::Owned<HostObject> parse(const std::string& document) {
  const base::Owned<base::Data> data(new base::Data(document));
  HostStringRef error;
  base::Owned<HostObject> read(HostParsePropertyList(HostDataRef(data.get()), &error).object);
  EXPECT_NE(read == nullptr, error == nullptr);
  problem = base::textOf(error);
  HostRelease(error);
  return read;
}

template <typename T>
T* value(const base::Owned<HostObject>& list, const char* key) {
  return base::as<T>(HostDictionaryGetValue(HostDictionaryRef(list.get()), HostGetConstantString(key)));
}

std::string inPlist(const std::string& content) { return "<plist version=\"1.0\">" + content + "</plist>"; }

TEST(PropertyList, EveryKindOfValue) {
  const auto list = parse(R"(<?xml version="1.0" encoding="UTF-8"?>
<!DOCTYPE plist PUBLIC "-//TARN//DTD PLIST 1.0//EN" "http://tarn.example/plist.dtd">
<plist version="1.0"><dict> <!-- > -->
  <key>s&amp;t</key> <string>&lt;a&#62;&#x20AC;<![CDATA[<&]]><!-- no -->b</string>
  <key>i</key><integer>-9223372036854775808</integer> <key>r</key><real>+1.5e3</real>
  <key>yes</key><true/> <key>no</key><false></false>
  <key>data</key><data> AAEC
    /w== </data> <key>date</key><date>2001-02-03T04:05:06Z</date>
  <key>list</key><array><string/><dict/></array>
  <key>i</key><integer>+7</integer>
</dict></plist>
)");
  EXPECT_EQ(value<base::String>(list, "s&t")->text, "<a>\xE2\x82\xAC<&b");
  const std::pair<const char*, base::Number::Content> numbers[] = {
      {"i", std::int64_t{7}}, {"r", 1500.0}, {"yes", true}, {"no", false}};
  for (const auto& [key, number] : numbers) EXPECT_EQ(value<base::Number>(list, key)->value, number) << key;
  EXPECT_EQ(value<base::Data>(list, "data")->bytes, std::string("\0\1\2\xFF", 4));
  EXPECT_EQ(value<base::String>(list, "date")->text, "2001-02-03T04:05:06Z");
  EXPECT_EQ(value<base::List>(list, "list")->items.size(), 2u);
}

TEST(PropertyList, MalformedOnesGiveNothingAndLeaveNothing) {
  const auto refuse = [](const std::string& all, const std::string& before, const std::string& after) {
    std::istringstream items(all);
    for (std::string item; items >> item;)
      EXPECT_EQ(parse((std::string(before) += item) += after), nullptr) << item;
  };
  refuse("plain <plist> <dict/> <plist><dict/></plist>x", "", "");
  refuse("[<!ENTITY>]> <!ENTITY>", "<!DOCTYPE plist ", inPlist("<dict/>"));
  refuse(
      "<array/> <dict> <dict/><dict/> <dict><key>k</key></dict> <dict><true/></dict> <dict></dic> <dict/x>",
      "<plist>", "</plist>");
  refuse(R"(<integer>1x</integer> <integer>9223372036854775808</integer> <integer>+-1</integer> <real/>
            <data>AAA</data> <data>A=AA</data> <date>2001-02-03</date> <true>1</true> <widget>a</widget>
            <string>&nbsp;</string> <string>&#0;</string> <string>&#xD800;</string> <string>a<b/></string>
            <string>a</strin> <!----x--><true/>)",
         "<plist><dict><key>k</key>", "</dict></plist>");
  std::string deep = "<dict/>";
  for (int i = 0; i < 100; ++i) deep.insert(0, "<array>").append("</array>");
  refuse(deep, "<plist><dict><key>k</key>", "</dict></plist>");
  EXPECT_EQ(parse(inPlist("<dict/>") + std::string(5u << 20, ' ')), nullptr);
  EXPECT_EQ(parse(inPlist("<dict><key>\xFF</key><true/></dict>")), nullptr);
  parse("<plist>\n<dict>\n<key/>");
  EXPECT_EQ(problem.substr(0, 7), "line 3:");
  for (const std::size_t count : base::aliveByKind()) EXPECT_EQ(count, 0u);
}

TEST(Bundle, ResourcesLieInsideTheDirectory) {
  const TemporaryDirectory directory;
  const HostBundleRef bundle = HostCreateBundle(directory.path.c_str());
  const auto find = [&](const char* name) {
    return HostCopyBundleResourceLocation(bundle, HostGetConstantString(name), HostGetConstantString("plist"),
                                          {});
  };
  std::ofstream(directory.path / "version.plist") << "content";
  EXPECT_EQ(base::as<base::Data>(HostReadResourceData(find("version")))->bytes, "content");
  std::filesystem::create_directories(directory.path / "Contents/Resources/folder.plist");
  for (const char* name : {"version", "../../version", "folder", ""}) EXPECT_FALSE(find(name)) << name;
  EXPECT_FALSE(HostCreateBundle((directory.path / "absent").c_str()));
}

}  // namespace
