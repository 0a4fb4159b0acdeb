#!/bin/sh
# Fails when a file of the library includes a file of a layer above its own.
# Layers, lowest first: host; the record (core, motors, sensors,
# drive_serial_network); program; checker; model.
root=${1:-.}
rank() {
  case "$1" in
    host) echo 0 ;;
    core|motors|sensors|drive_serial_network) echo 1 ;;
    program) echo 2 ;;
    checker) echo 3 ;;
    model) echo 4 ;;
    *) echo 9 ;;
  esac
}
status=0
for file in "$root"/robotconfig/*/*; do
  folder=$(basename "$(dirname "$file")")
  own=$(rank "$folder")
  for used in $(sed -n 's@^ *# *include *"robotconfig/\([a-z_]*\)/.*@\1@p' "$file" | sort -u); do
    if [ "$(rank "$used")" -gt "$own" ]; then
      echo "$file includes the higher layer $used/"
      status=1
    fi
  done
done
exit $status
