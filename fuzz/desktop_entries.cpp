// Desktop entries, as kvd-entries reads them, and the records of it that kvd reads.

#include <gio/gdesktopappinfo.h>

#include <memory>
#include <string>

#include "fuzz/fuzz.h"
#include "platform/linux/programs/desktop_entry.h"

namespace {

using fuzz::require;
using linux::programs::Entry;
using linux::programs::fromRecord;
using linux::programs::toRecord;

void checkRecord(const Entry& entry) {
  const std::string record = toRecord(entry);
  require(record.find('\n') == record.size() - 1, "a record is one line");
  const auto again = fromRecord(record);
  require(again.has_value() && toRecord(*again) == record, "a record reads as it was written");
}

/// The entry in a file with this text; nothing where GIO finds none there.
std::optional<Entry> entryIn(const std::string& text) {
  const std::unique_ptr<GKeyFile, decltype(&g_key_file_unref)> file(g_key_file_new(), g_key_file_unref);
  if (g_key_file_load_from_data(file.get(), text.data(), text.size(), G_KEY_FILE_NONE, nullptr) == FALSE) {
    return std::nullopt;
  }
  const std::unique_ptr<GDesktopAppInfo, decltype(&g_object_unref)> info(
      g_desktop_app_info_new_from_keyfile(file.get()), g_object_unref);
  if (info == nullptr) return std::nullopt;
  return linux::programs::entryIn(info.get(), "player");
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string text(fuzz::textOf(data, size));
  if (const auto entry = entryIn(text)) checkRecord(*entry);
  if (const auto entry = fromRecord(text)) checkRecord(*entry);
  return 0;
}
