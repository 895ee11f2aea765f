# What the commands share: where they are, how they speak, and who owns what they build. Sourced from bash.

cd "$(dirname "${BASH_SOURCE[0]}")/../.."

say() { printf '\n== %s\n' "$*"; }

# Through sudo the files are made by root; the one who called sudo gets them back.
give_back() {
  if [ "$(id -u)" -eq 0 ] && [ "${SUDO_UID:-0}" -ne 0 ] && [ -d build ]; then
    chown -R --from=root "$SUDO_UID:${SUDO_GID:-$SUDO_UID}" build
  fi
}

# What configure_and_build hands to CMake beside the preset.
cmake_options=()

# configure_and_build PRESET [TARGET...]: says nothing where all is well, and the whole log where it is not.
configure_and_build() {
  local preset=$1
  shift
  local log=build/$preset-configure.log
  mkdir -p build
  if ! cmake --preset "$preset" "${cmake_options[@]}" >"$log" 2>&1; then
    cat "$log" >&2
    return 1
  fi
  cmake --build --preset "$preset" -- --quiet -k 0 "$@"
}
