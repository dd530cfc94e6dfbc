# shellcheck shell=bash disable=SC2034
# What the scripts share. Each sources this file first; it takes them to the root of the tree.

root=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
cd "$root" || exit

jobs=$(nproc)
# Python leaves no compiled files in the tree.
export PYTHONDONTWRITEBYTECODE=1
buildPackages=(cmake g++ libboost-dev libcli11-dev libtomlplusplus-dev ninja-build nlohmann-json3-dev scdoc)
testPackages=(g++-multilib googletest groff-base mypy pkgconf python3-jsonschema python3-pip python3-pytest python3-setuptools python3-wheel)
benchPackages=(g++-multilib libbenchmark-dev libexpat1-dev libpugixml-dev librapidxml-dev libxml2-dev python3)
checkPackages=(black clang clang-format clang-tidy mypy python3-pytest shellcheck)
abiPackages=(abigail-tools)
coveragePackages=(gcovr python3)
fuzzPackages=(clang libclang-rt-14-dev libxml2-dev)
mutationPackages=(python3)
valgrindPackages=(libc6-dbg valgrind)

say() { printf '%s\n' "$@"; }

fail() {
    say "$@" >&2
    exit 1
}

# Runs a command with its output in a file, and shows that only when the command fails.
quietly() {
    local log=$1
    shift
    mkdir -p "$(dirname "$log")"
    if ! "$@" >"$log" 2>&1 </dev/null; then
        cat "$log" >&2
        fail "Failed: $*"
    fi
}

isInstalled() {
    [[ $(dpkg-query --show --showformat='${db:Status-Status}' "$1" 2>/dev/null) == installed* ]]
}

# Installs what is missing of the packages named, or says what that is where it may not.
requirePackages() {
    local package missing=() asRoot=()
    for package in "$@"; do
        isInstalled "$package" || missing+=("$package")
    done
    ((${#missing[@]} > 0)) || return 0
    if ((EUID != 0)); then
        if ! sudo -n true 2>/dev/null; then
            fail "Missing packages: ${missing[*]}" \
                "Install them with: apt-get install ${missing[*]}"
        fi
        asRoot=(sudo -n)
    fi
    say "Installing ${missing[*]}"
    quietly build/apt-update.log "${asRoot[@]}" apt-get update
    quietly build/apt-install.log "${asRoot[@]}" env DEBIAN_FRONTEND=noninteractive \
        apt-get install --yes --no-install-recommends "${missing[@]}"
}

# buildPreset <preset> [<targets>...] [-- <configuration arguments>...]
buildPreset() {
    local preset=$1 targets=()
    shift
    while (($# > 0)) && [[ $1 != -- ]]; do
        targets+=("$1")
        shift
    done
    (($# == 0)) || shift
    ((${#targets[@]} > 0)) || targets=(all)
    quietly "build/$preset/configure.log" cmake --preset "$preset" "$@"
    quietly "build/$preset/build.log" \
        cmake --build --preset "$preset" --parallel "$jobs" --target "${targets[@]}"
}

# The instructions of a function and all that it calls: countInstructions <function> <program> <arguments>...
# The C library's functions choose their code by the processor; here they take what all have.
countInstructions() {
    local function=$1 log=build/callgrind.log
    shift
    GLIBC_TUNABLES=glibc.cpu.hwcaps=-AVX2,-AVX,-BMI2,-ERMS,-FSRM,-SSE4_2,-SSE4_1,-SSSE3 \
        valgrind --tool=callgrind --callgrind-out-file=build/callgrind.out --toggle-collect="$function" \
        "$@" >/dev/null 2>"$log" || {
        cat "$log" >&2
        return 1
    }
    sed -n 's/.*Collected : //p' "$log"
}
