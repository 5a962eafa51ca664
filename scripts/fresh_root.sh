# A fresh minimal Debian 12 to try things in; to be sourced after packages.sh, by root.
#   make_fresh_root    sets root to its folder; it goes when the script ends
#   in_root COMMAND    runs a command in it

leave_fresh_root() {
    local mounted
    for mounted in dev/pts dev proc sys; do
        if mountpoint -q "$root/$mounted"; then umount --lazy "$root/$mounted"; fi
    done
    mountpoint -q "$root/dev" || mountpoint -q "$root/proc" || mountpoint -q "$root/sys" || rm -rf "$root"
}

in_root() {
    chroot "$root" env -i PATH=/usr/sbin:/usr/bin:/sbin:/bin HOME=/root LANG=C.UTF-8 DEBIAN_FRONTEND=noninteractive \
        CI="${CI:-}" "$@"
}

make_fresh_root() {
    local mirror
    need_packages root
    mirror=$(apt-get indextargets --format '$(REPO_URI) $(CODENAME) $(COMPONENT)' | awk '$2 == "bookworm" && $3 == "main" { print $1; exit }')
    [ -n "$mirror" ] || fail "this machine's apt knows no Debian 12 archive"
    root=$(mktemp -d)
    chmod 755 "$root"  # others than root live there, too
    trap leave_fresh_root EXIT
    say "making a fresh Debian 12"
    debootstrap --variant=minbase bookworm "$root" "$mirror" >"$root.log" 2>&1 || { tail "$root.log" >&2; fail "debootstrap failed"; }
    rm "$root.log"
    rm -f "$root/etc/apt/sources.list"
    cp -r /etc/apt/sources.list.d /etc/apt/apt.conf.d "$root/etc/apt/"
    find "$root/etc/apt/sources.list.d" -type f ! -name 'debian.sources' -delete
    [ -f "$root/etc/apt/sources.list.d/debian.sources" ] || cp /etc/apt/sources.list "$root/etc/apt/"
    cp /etc/resolv.conf "$root/etc/resolv.conf"
    mount --bind /dev "$root/dev"
    mount -t devpts devpts "$root/dev/pts" 2>/dev/null || true
    mount -t proc proc "$root/proc"
    mount -t sysfs sysfs "$root/sys"
    in_root apt-get update -qq || fail "the fresh system cannot reach the package archive"
}
