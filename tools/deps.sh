# Sourced by tools/test.sh and tools/demo.sh: installs the Debian packages a
# script needs when they are missing. As root it uses apt-get directly (one
# `apt-get update` first); otherwise sudo without a password prompt, or it
# says which packages to install and stops.

pvx_need_packages() {
    local missing=() p
    for p in "$@"; do
        if ! dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q 'install ok installed'; then
            missing+=("$p")
        fi
    done
    [ ${#missing[@]} -eq 0 ] && return 0
    if ! command -v apt-get >/dev/null 2>&1; then
        echo "pvx: missing packages ${missing[*]} and no apt-get here; install them by hand" >&2
        return 1
    fi
    local sudo=()
    if [ "$(id -u)" -ne 0 ]; then
        if command -v sudo >/dev/null 2>&1 && sudo -n true 2>/dev/null; then
            sudo=(sudo -n)
        else
            echo "pvx: missing packages: ${missing[*]}" >&2
            echo "pvx: run as root, or: sudo apt-get install ${missing[*]}" >&2
            return 1
        fi
    fi
    echo "pvx: installing ${missing[*]}"
    export DEBIAN_FRONTEND=noninteractive
    if [ -z "${PVX_APT_UPDATED:-}" ]; then
        "${sudo[@]}" apt-get update -q
        export PVX_APT_UPDATED=1
    fi
    "${sudo[@]}" apt-get install -y -q --no-install-recommends "${missing[@]}" </dev/null
}

# Parallel jobs for builds and ctest.
pvx_jobs() {
    nproc 2>/dev/null || echo 2
}
