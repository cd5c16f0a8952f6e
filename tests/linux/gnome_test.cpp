// What is believed of a GNOME Shell that says anything, and what its remote desktop is told.

#include "platform/linux/windows/gnome/gnome.h"

#include <gtest/gtest.h>

#include <atomic>
#include <functional>
#include <future>
#include <thread>

#include "platform/linux/system/bus.h"
#include "tests/linux/fake_session.h"

namespace {

using namespace linux;
using windows::gnome::kBackend;

/// On a connection and a thread of its own.
class Shell {
 public:
  std::function<void(sd_bus_message* answer)> tell;
  std::vector<std::string> told;

  Shell() {
    std::promise<void> isThere;
    thread_ = std::thread([&] { serve(isThere); });
    isThere.get_future().wait();
  }
  ~Shell() {
    ends_ = true;
    thread_.join();
  }

 private:
  void serve(std::promise<void>& isThere) {
    sd_bus* bus = nullptr;
    sd_bus_open_user(&bus);
    sd_bus_request_name(bus, "org.gnome.Shell", 0);
    sd_bus_request_name(bus, "org.gnome.Mutter.RemoteDesktop", 0);
    sd_bus_add_filter(bus, nullptr, answer, this);
    isThere.set_value();
    while (!ends_) {
      if (sd_bus_process(bus, nullptr) == 0) sd_bus_wait(bus, 20'000);
    }
    sd_bus_flush_close_unref(bus);
  }

  static int answer(sd_bus_message* call, void* context, sd_bus_error*) {
    Shell& self = *static_cast<Shell*>(context);
    const std::string member = sd_bus_message_get_member(call);
    sd_bus_message* reply = nullptr;
    if (sd_bus_message_new_method_return(call, &reply) < 0) return 0;
    std::uint32_t keysym = 0;
    int down = 0;
    if (member == "List") self.tell(reply);
    if (member == "CreateSession") sd_bus_message_append(reply, "o", "/session");
    if (sd_bus_message_read(call, "ub", &keysym, &down) > 0) {
      self.told.push_back(std::to_string(keysym) + (down != 0 ? " down" : " up"));
    } else if (member != "List") {
      self.told.push_back(member);
    }
    sd_bus_send(nullptr, reply, nullptr);
    sd_bus_message_unref(reply);
    // It tells of the end before it answers anything else.
    if (keysym == 'q') {
      sd_bus_emit_signal(sd_bus_message_get_bus(call), "/session", "org.gnome.Mutter.RemoteDesktop.Session",
                         "Closed", "");
    }
    return 1;
  }

  std::atomic<bool> ends_ = false;
  std::thread thread_;
};

TEST(Gnome, WhatIsNoWindowIsPassedOver) {
  fake::beginSession();
  setenv("WAYLAND_DISPLAY", "none", 1);
  Shell shell;
  const struct {
    const char* what;
    std::function<void(sd_bus_message*)> tell;
    std::size_t windows;
    bool knowsFront;
  } cases[] = {
      {"no list", [](auto* answer) { sd_bus_message_append(answer, "s", "windows"); }, 0, false},
      {"one without a number, one of wrong types",
       [](auto* answer) {
         sd_bus_message_append(answer, "aa{sv}a(iiii)", 2, 1, "title", "s", "A", 5, "id", "u", 7, "title",
                               "as", 1, "B", "process", "s", "1", "is-active", "u", 1, "area", "(ii)", 1, 2,
                               0);
       },
       1, true},
      {"too many",
       [](auto* answer) {
         sd_bus_message_open_container(answer, 'a', "a{sv}");
         for (int i = 1; i < 2000; ++i) sd_bus_message_append(answer, "a{sv}", 1, "id", "u", i);
         sd_bus_message_close_container(answer);
         sd_bus_message_append(answer, "a(iiii)", 0);
       },
       512, true},
  };
  for (const auto& [what, tell, windows, knowsFront] : cases) {
    shell.tell = tell;
    kBackend.takeIn();
    EXPECT_EQ(kBackend.list().size(), windows) << what;
    EXPECT_EQ(kBackend.knowsFront(), knowsFront) << what;
    for (const auto& each : kBackend.list()) EXPECT_EQ(each.title + (each.isActive ? "!" : ""), "") << what;
    kBackend.close();
  }
  system::closeBus();
  fake::endSession();
}

TEST(Gnome, KeysGoThroughASessionThatMayEnd) {
  fake::beginSession();
  setenv("WAYLAND_DISPLAY", "none", 1);
  Shell shell;
  shell.tell = [](auto* answer) {
    sd_bus_message_append(answer, "aa{sv}a(iiii)", 2, 3, "id", "u", 1, "is-active", "b", 1, "is-full-screen",
                          "b", 1, 1, "id", "u", 2, 0);
  };
  kBackend.takeIn();
  const auto window = [](std::size_t which) { return kBackend.list().at(which).id.number; };
  EXPECT_TRUE(kBackend.list()[0].isFullScreen && !kBackend.list()[0].isDialog);
  windows::Window gone = kBackend.list()[0];
  gone.id.number = 9;
  kBackend.look({&gone, 1});
  EXPECT_FALSE(gone.isFullScreen);
  EXPECT_FALSE(kBackend.sendKey(window(1), 'm', true, windows::kNoModifier)) << "it is not in front";
  EXPECT_TRUE(kBackend.sendKey(window(0), 'm', true, windows::kShift));
  EXPECT_TRUE(kBackend.sendKey(window(1), 'm', false, windows::kShift)) << "owed all the same";
  EXPECT_TRUE(kBackend.sendKey(window(0), 'q', true, windows::kNoModifier));
  // Its answer comes after the news.
  system::call({"org.gnome.Shell", 0}, {"/", "test.Shell", "Ping"}, system::kCommandLimit, "");
  EXPECT_FALSE(kBackend.sendKey(window(0), 'q', false, windows::kNoModifier)) << "the end has released it";
  EXPECT_TRUE(kBackend.sendKey(window(0), 'a', true, windows::kNoModifier));
  kBackend.close();
  system::call({"org.gnome.Shell", 0}, {"/", "test.Shell", "Ping"}, system::kCommandLimit, "");
  const std::vector<std::string> expected = {
      "CreateSession", "Start",         "65505 down", "109 down", "109 up", "65505 up", "113 down",
      "Ping",          "CreateSession", "Start",      "97 down",  "Stop",   "Ping"};
  EXPECT_EQ(shell.told, expected);
  system::closeBus();
  fake::endSession();
}

}  // namespace
