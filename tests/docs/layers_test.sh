#!/usr/bin/env bash
# The table of layers in docs/architecture.md is the table that the build is made from.
source "$(dirname -- "${BASH_SOURCE[0]}")/../scripts/harness.sh"
cd "$tree" || exit 1

# Both as lines "NAME FOLDER USED USED...".
built=$(sed -n 's/^ *orvane_layer(\(.*\))$/\1/p' cmake/Layers.cmake | sed 's/ FOLDER / /; s/ USES / /')
shown=$(awk -F ' *[|] *' '$2 ~ /^[a-z]+$/ && $3 ~ /^`/ {
    gsub(/`/, "", $3)
    gsub(/,/, "", $5)
    print $2, $3 ($5 == "" ? "" : " " $5)
}' docs/architecture.md)

case_named "both tables have the same lines"
[ -n "$built" ] || fail "no layer in cmake/Layers.cmake"
expect_equal "$(sort <<<"$shown")" "$(sort <<<"$built")"
finish
