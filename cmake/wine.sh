# How Wine is run here, quietly and as 64-bit Windows; to be sourced.
#   make_wine_folder FOLDER    makes the folder that stands for a Windows machine, once

export WINEARCH=win64 WINEDEBUG=-all WINEDLLOVERRIDES="mscoree,mshtml=;winemenubuilder.exe=d"

# Without a display, where it would show a window meanwhile. Wine fails when several programs make it at the same time.
make_wine_folder() {
    flock --close "$1.lock" env -u DISPLAY -u WAYLAND_DISPLAY WINEPREFIX="$1" \
        sh -c '[ -d "$WINEPREFIX" ] || { wine wineboot --init && wineserver --wait; }'
}
