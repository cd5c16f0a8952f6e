// The scripts that kvd has KWin run where it may not ask for windows itself. The names on the right of || are
// those of Plasma 5.
#pragma once

namespace linux::windows::kwin {

/// Calls tell(windows), which is put before it, with the windows, in JSON, topmost first, as often as
/// something about them has changed.
inline constexpr char kReportScript[] = R"js(
function list() {
  return workspace.windowList ? workspace.windowList() : workspace.clientList();
}

function isOnDesktop(window) {
  const current = workspace.currentDesktop;
  return window.onAllDesktops ||
      (typeof current === "number" ? window.desktop === current : window.desktops.indexOf(current) >= 0);
}

function describe(window) {
  return {
    uuid: String(window.internalId),
    process: window.pid,
    entry: String(window.desktopFileName),
    class: String(window.resourceClass),
    instance: String(window.resourceName),
    title: String(window.caption),
    dialog: window.transient,
    active: window.active,
    full: window.fullScreen,
    shown: !window.minimized && isOnDesktop(window),
    x: Math.round(window.frameGeometry.x),
    y: Math.round(window.frameGeometry.y),
  };
}

let last = "";
function report(gone) {
  const opened = list().filter(each => each && each !== gone && !each.deleted && !each.skipTaskbar);
  opened.sort((one, other) => other.stackingOrder - one.stackingOrder);
  const text = JSON.stringify(opened.map(describe));
  if (text !== last) tell(text);
  last = text;
}

function follow(window) {
  for (const changed of ["captionChanged", "fullScreenChanged", "minimizedChanged", "desktopsChanged", "desktopChanged",
                         "outputChanged", "windowClassChanged", "desktopFileNameChanged", "skipTaskbarChanged"]) {
    if (window[changed]) window[changed].connect(() => report());
  }
}

list().forEach(follow);
(workspace.windowAdded || workspace.clientAdded).connect(window => { follow(window); report(); });
(workspace.windowRemoved || workspace.clientRemoved).connect(report);
(workspace.windowActivated || workspace.clientActivated).connect(() => report());
workspace.currentDesktopChanged.connect(() => report());
report();
)js";

/// Activates the window with the id `uuid`, which is put before it.
inline constexpr char kActivateScript[] = R"js(
const windows = workspace.windowList ? workspace.windowList() : workspace.clientList();
const found = windows.find(each => String(each.internalId) === uuid);
if (found) workspace[workspace.windowList ? "activeWindow" : "activeClient"] = found;
)js";

}  // namespace linux::windows::kwin
