# Sourced by the commands in this folder: the packages they need, and the build trees they use.

cd "$(dirname "${BASH_SOURCE[0]}")/.."

build_packages=(cmake ninja-build g++ pkg-config python3
    libcli11-dev libeigen3-dev libfmt-dev nlohmann-json3-dev libpugixml-dev libtomlplusplus-dev)
fuzz_packages=(clang libclang-rt-14-dev)
page_packages=(npm)
test_packages=(chromium libgtest-dev libmpfr-dev clang clang-tidy clang-format doxygen binutils python3
    valgrind)
python_packages=("${build_packages[@]}" python3-dev python3-venv)

# npm may have come with a node that is not Debian's, which Debian's npm would drive out. Debian's is
# some 400 small packages.
command -v npm >/dev/null && command -v node >/dev/null && page_packages=()

# Installs those of the packages that the system does not have. Stops where it may not.
install_packages() {
    if ! command -v apt-get >/dev/null; then
        echo "Needed here, by their Debian names: $*. There is no apt-get to install them with." >&2
        return
    fi
    local package missing=() root=()
    for package in "$@"; do
        [[ $(dpkg-query -W -f='${db:Status-Status}' "$package" 2>&1) == installed ]] ||
            missing+=("$package")
    done
    ((${#missing[@]})) || return 0
    if ((EUID)); then
        command -v sudo >/dev/null ||
            { echo "Please install, as root: apt-get install ${missing[*]}" >&2; exit 1; }
        root=(sudo)
    fi
    echo "Installing system-wide by apt-get, ${root[*]:+by sudo }as root: ${missing[*]}" >&2
    {
        "${root[@]}" apt-get -qq update
        "${root[@]}" env DEBIAN_FRONTEND=noninteractive \
            apt-get -qq -y --no-install-recommends -o Dpkg::Use-Pty=0 install "${missing[@]}"
    } </dev/null >&2
}

# Configures and builds build-PRESET, or one target of it; what is up to date is not built again.
build() {
    local preset=$1
    shift
    cmake --preset "$preset"
    cmake --build --preset "$preset" "$@"
}

# Makes a Python environment in a folder, and installs packages into it. The package of this
# repository is built in the same folder, where what is up to date is not built again.
python_environment() {
    local folder=$1
    shift
    echo "Installing into $folder alone by pip, as $(id -un): $*" >&2
    [[ -x $folder/bin/python ]] || python3 -m venv "$folder"
    "$folder/bin/pip" install --quiet --disable-pip-version-check \
        --config-settings=build-dir="$PWD/$folder/cmake" "$@"
}

# The source of pugixml, of which Debian has a compiled library, in a folder.
pugixml_source() {
    local folder=$1 apt
    [[ ! -f $folder/pugixml.cpp ]] || return 0
    rm -rf "$folder.apt"
    mkdir -p "$folder.apt/lists/partial" "$folder.apt/parts"
    sed 's/^Types: deb$/Types: deb-src/' /etc/apt/sources.list.d/debian.sources \
        >"$folder.apt/parts/source.sources"
    apt=(apt-get -qq -o Dir::Etc::sourcelist=/dev/null -o Dir::Etc::sourceparts="$folder.apt/parts"
        -o Dir::State::lists="$folder.apt/lists" -o APT::Sandbox::User="$(id -un)")
    "${apt[@]}" update
    (cd "$folder.apt" && "${apt[@]}" source pugixml >&2)
    mkdir -p "$folder"
    mv "$folder.apt"/pugixml-*/src/* "$folder"
    rm -r "$folder.apt"
}
