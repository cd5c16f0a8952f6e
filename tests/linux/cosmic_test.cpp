// COSMIC's compositor, as one of two windows would have it speak.

#include <gtest/gtest.h>
#include <wayland-server.h>

#include <cstdlib>
#include <thread>

#include "cosmic_server.h"
#include "platform/base/run_loop.h"
#include "platform/linux/windows/cosmic/cosmic.h"
#include "platform/linux/windows/windows.h"
#include "tests/temporary_directory.h"

namespace {

using namespace linux;

wl_resource* sOutput = nullptr;
wl_resource* sInfo = nullptr;
bool sFirst = true;

void destroy(wl_client*, wl_resource* resource) { wl_resource_destroy(resource); }
void ignore(wl_client*, wl_resource*) {}

const struct ext_foreign_toplevel_list_v1_interface kListRequests { .stop = ignore, .destroy = destroy };
const struct ext_foreign_toplevel_handle_v1_interface kHandleRequests { .destroy = destroy };
const struct zcosmic_toplevel_handle_v1_interface kDetailsRequests { .destroy = destroy };

/// The second that is asked for is in front, and covers the output.
void describe(wl_client* client, wl_resource*, std::uint32_t id, wl_resource*) {
  wl_resource* const details = wl_resource_create(client, &zcosmic_toplevel_handle_v1_interface, 2, id);
  wl_resource_set_implementation(details, &kDetailsRequests, nullptr, nullptr);
  zcosmic_toplevel_handle_v1_send_output_enter(details, sOutput);
  std::uint32_t states[] = {ZCOSMIC_TOPLEVEL_HANDLE_V1_STATE_ACTIVATED,
                            ZCOSMIC_TOPLEVEL_HANDLE_V1_STATE_FULLSCREEN};
  wl_array told{.size = sFirst ? 0 : sizeof states, .alloc = 0, .data = states};
  zcosmic_toplevel_handle_v1_send_state(details, &told);
  sFirst = false;
  zcosmic_toplevel_info_v1_send_done(sInfo);
}

const struct zcosmic_toplevel_info_v1_interface kInfoRequests {
  .stop = ignore, .get_cosmic_toplevel = describe
};

void bindOutput(wl_client* client, void*, std::uint32_t version, std::uint32_t id) {
  sOutput = wl_resource_create(client, &wl_output_interface, static_cast<int>(version), id);
  wl_output_send_mode(sOutput, WL_OUTPUT_MODE_CURRENT, 1280, 720, 0);
}

void bindInfo(wl_client* client, void*, std::uint32_t version, std::uint32_t id) {
  sInfo = wl_resource_create(client, &zcosmic_toplevel_info_v1_interface, static_cast<int>(version), id);
  wl_resource_set_implementation(sInfo, &kInfoRequests, nullptr, nullptr);
}

void bindList(wl_client* client, void*, std::uint32_t, std::uint32_t id) {
  wl_resource* const list = wl_resource_create(client, &ext_foreign_toplevel_list_v1_interface, 1, id);
  wl_resource_set_implementation(list, &kListRequests, nullptr, nullptr);
  for (const char* const name : {"Dune", "Jaws"}) {
    wl_resource* const handle = wl_resource_create(client, &ext_foreign_toplevel_handle_v1_interface, 1, 0);
    wl_resource_set_implementation(handle, &kHandleRequests, nullptr, nullptr);
    ext_foreign_toplevel_list_v1_send_toplevel(list, handle);
    ext_foreign_toplevel_handle_v1_send_title(handle, name);
    ext_foreign_toplevel_handle_v1_send_app_id(handle, "mpv");
    ext_foreign_toplevel_handle_v1_send_done(handle);
  }
}

TEST(Cosmic, ItsWindowsAreKnown) {
  const TemporaryDirectory directory;
  wl_display* const display = wl_display_create();
  setenv("WAYLAND_DISPLAY", wl_display_add_socket_auto(display), 1);
  wl_global_create(display, &wl_output_interface, 1, nullptr, bindOutput);
  wl_global_create(display, &ext_foreign_toplevel_list_v1_interface, 1, nullptr, bindList);
  wl_global_create(display, &zcosmic_toplevel_info_v1_interface, 2, nullptr, bindInfo);
  std::thread server([&] { wl_display_run(display); });

  windows::init({&windows::cosmic::kBackend});
  // A connection that is late is tried again in another pass of the loop.
  while (windows::list().size() < 2 || windows::front() == nullptr) {
    base::runPending();
    windows::takeIn();
  }
  const windows::ID front[] = {windows::front()->id};
  EXPECT_EQ(windows::look(front).at(0).title, "Jaws");
  EXPECT_EQ(windows::list()[0].id, front[0]) << "topmost";
  EXPECT_EQ(windows::list()[1].applicationID, "mpv");
  ASSERT_EQ(windows::outputs().size(), 1U);
  EXPECT_TRUE(windows::isCaptured(windows::outputs()[0].id));
  wl_display_terminate(display);
  server.join();
  wl_display_destroy_clients(display);
  wl_display_destroy(display);
  windows::takeIn();
  EXPECT_TRUE(windows::list().empty());
  windows::finish();
}

}  // namespace
