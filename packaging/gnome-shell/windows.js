// Tells kvd of the windows, over the shell's own connection to the session bus.
const OBJECT_PATH = '/com/tarn/kvd/Windows';
const INTERFACE = `
<node>
  <interface name="com.tarn.kvd.Windows">
    <!-- Topmost first; what a window lacks is left out. Monitors: x, y, width, height. -->
    <method name="List">
      <arg type="aa{sv}" direction="out" name="windows"/>
      <arg type="a(iiii)" direction="out" name="monitors"/>
    </method>
    <method name="Activate">
      <arg type="u" direction="in" name="id"/>
    </method>
    <!-- The list is another one, or there is one at all, or no more. Sent once until somebody asks again. -->
    <signal name="Changed"/>
  </interface>
</node>`;

const TYPES = [
    Meta.WindowType.NORMAL,
    Meta.WindowType.DIALOG,
    Meta.WindowType.MODAL_DIALOG,
    Meta.WindowType.UTILITY,
];

const CHANGES_OF_WINDOW = [
    'notify::wm-class',
    'notify::gtk-application-id',
    'notify::minimized',
    'notify::fullscreen',
    'workspace-changed',
    'unmanaged',
];

function rectangleOf({x, y, width, height}) {
    return new GLib.Variant('(iiii)', [x, y, width, height]);
}

function describe(window) {
    const told = {};
    const text = (key, value) => {
        if (value)
            told[key] = GLib.Variant.new_string(value);
    };
    const flag = (key, value) => {
        if (value)
            told[key] = GLib.Variant.new_boolean(true);
    };
    const workspace = global.workspace_manager.get_active_workspace();
    const isFullScreen = window.is_fullscreen();
    // What a program of Wayland calls itself the shell keeps as the class.
    const isOfX11 = window.get_client_type() === Meta.WindowClientType.X11;
    // The frame of one that has just gone full screen is still the old one.
    const area = isFullScreen
        ? global.display.get_monitor_geometry(window.get_monitor())
        : window.get_frame_rect();

    told.id = GLib.Variant.new_uint32(window.get_stable_sequence());
    told.process = GLib.Variant.new_int32(window.get_pid());
    told.area = rectangleOf(area);
    text('application-id', window.get_sandboxed_app_id() || window.get_gtk_application_id() ||
        (isOfX11 ? null : window.get_wm_class()));
    text('class', window.get_wm_class());
    text('instance', window.get_wm_class_instance());
    text('title', window.get_title());
    text('gtk-bus-name', window.get_gtk_unique_bus_name());
    text('gtk-application-path', window.get_gtk_application_object_path());
    text('gtk-window-path', window.get_gtk_window_object_path());
    flag('is-active', window === global.display.focus_window);
    flag('is-dialog', window.get_transient_for() !== null);
    flag('is-full-screen', isFullScreen);
    flag('is-shown', window.showing_on_its_workspace() && window.located_on_workspace(workspace));
    return told;
}

class Windows {
    constructor() {
        this._isAwaited = true;
        this._timer = 0;
        this._object = Gio.DBusExportedObject.wrapJSObject(INTERFACE, this);
        this._object.export(Gio.DBus.session, OBJECT_PATH);

        const changed = () => this._change();
        global.display.connectObject(
            'window-created', (_display, window) => {
                this._follow(window);
                this._change();
            },
            'notify::focus-window', changed,
            'restacked', changed,
            'window-entered-monitor', changed,
            'workareas-changed', changed,
            this);
        global.workspace_manager.connectObject('active-workspace-changed', changed, this);
        this._windows().forEach(window => this._follow(window));
        this._change();
    }

    destroy() {
        this._windows().forEach(window => window.disconnectObject(this));
        global.workspace_manager.disconnectObject(this);
        global.display.disconnectObject(this);
        this._change();
        this._object.unexport();
        if (this._timer)
            GLib.source_remove(this._timer);
    }

    List() {
        this._isAwaited = true;
        const display = global.display;
        const windows = this._windows().filter(window => TYPES.includes(window.get_window_type()));
        const monitors = [];
        for (let i = 0; i < display.get_n_monitors(); i++) {
            const {x, y, width, height} = display.get_monitor_geometry(i);
            monitors.push([x, y, width, height]);
        }
        return [display.sort_windows_by_stacking(windows).reverse().map(describe), monitors];
    }

    Activate(id) {
        const window = this._windows().find(each => each.get_stable_sequence() === id);
        // Without a time it would not be brought from another workspace.
        window?.activate(global.display.get_current_time_roundtrip());
    }

    _windows() {
        return global.display.list_all_windows();
    }

    _follow(window) {
        const changed = () => this._change();
        window.connectObject(...CHANGES_OF_WINDOW.flatMap(signal => [signal, changed]), this);
        window.connectObject('notify::title', () => this._changeTitle(), this);
    }

    // Some programs turn a wheel in their titles.
    _changeTitle() {
        if (!this._isAwaited || this._timer)
            return;
        this._timer = GLib.timeout_add_seconds(GLib.PRIORITY_DEFAULT, 1, () => {
            this._timer = 0;
            this._change();
            return GLib.SOURCE_REMOVE;
        });
    }

    _change() {
        if (!this._isAwaited)
            return;
        this._isAwaited = false;
        this._object.emit_signal('Changed', null);
    }
}
