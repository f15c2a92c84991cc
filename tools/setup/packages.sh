# The scripts `run` and `test` source this file.

# Installs those packages of a list that are missing. The argument is the file with the list.
install_packages() {
  local list=$1 missing
  missing=$(sed 's/[[:space:]]*#.*//; /^$/d' "$list" | while read -r package; do
    dpkg-query -W -f '${db:Status-Status}' "$package" 2>/dev/null | grep -qx installed ||
      echo "$package"
  done)
  [ -z "$missing" ] && return
  if ! command -v apt-get >/dev/null; then
    echo "There is no apt-get here. Install the equivalents of these packages:" $missing >&2
    return 1
  fi
  local as_root=()
  if [ "$(id -u)" != 0 ]; then
    if ! command -v sudo >/dev/null; then
      echo "These packages are missing, and installing them needs root or sudo:" $missing >&2
      return 1
    fi
    as_root=(sudo)
  fi
  echo "Installing" $missing
  "${as_root[@]}" apt-get update -qq &&
    "${as_root[@]}" env DEBIAN_FRONTEND=noninteractive \
      apt-get install -y -qq --no-install-recommends $missing >/dev/null ||
    { echo "apt-get could not install all of these packages: $missing" >&2; return 1; }
}
