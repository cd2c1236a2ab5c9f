#!/usr/bin/env bash
# Fails when a folder includes a folder above it, or when the Qt-free core includes Qt.
# Layers, lowest first: base; platform, slots, settings; library; app; ui, which reaches the library
# only through app/.
set -euo pipefail
cd "$(dirname "$0")/.."
declare -A allowed=(
  [base]="base"
  [platform]="base platform"
  [slots]="base slots"
  [settings]="base settings"
  [library]="base slots library"
  [app]="base slots settings library app"
  [ui]="base platform slots settings app ui"
)
core="base slots settings library app"
bad=0
for folder in "${!allowed[@]}"; do
  for file in "$folder"/*.h "$folder"/*.cpp; do
    [ -f "$file" ] || continue
    while IFS= read -r included; do
      target=${included%%/*}
      case " ${allowed[$folder]} " in
      *" $target "*) ;;
      *)
        echo "$file includes $included: $folder/ may include only ${allowed[$folder]}"
        bad=1
        ;;
      esac
    done < <(sed -n 's/^#include "\([a-z_]*\/[^"]*\)".*/\1/p' "$file")
    if [[ " $core " == *" $folder "* ]] && grep -q '^#include <Q' "$file"; then
      echo "$file includes Qt: $folder/ is part of the Qt-free core"
      bad=1
    fi
  done
done
[ "$bad" -eq 0 ] && echo "layers: every include points down"
exit "$bad"
