#!/usr/bin/env bash
# Does what docs/adding-a-section.md tells its reader to do, in a folder of its own: writes the new
# files, and copies of the edited ones. What the reader types and sees goes to "typed" and "shown".
#   apply_page.sh PAGE ROOT_OF_THE_TREE FOLDER
#
# A line "<!-- new file: PATH -->" stands before a block that is the whole file, "<!-- edit: PATH -->"
# before one with lines of the file (a blank first) and lines to be added behind or between them ("+"
# first). The lines of the file must follow each other there, and only once. A tree in which the page
# has been followed stays as it is.
set -euo pipefail
page=$1 root=$2 folder=$3

# Prints the block behind the line given.
block() {
    awk -v mark="$1" '
        $0 == mark { wanted = 1; next }
        wanted && /^```/ { if (inside) exit; inside = 1; next }
        inside' "$page"
}

# Applies the edit that is standard input to the file given.
edited() {
    awk -v edit="$(cat)" '
        # The place of `count` lines in the file; 0 where they are not there or more than once.
        function place_of(lines, count,    start, i, place) {
            for (start = 1; start + count - 1 <= NR; ++start) {
                for (i = 1; i <= count && line[start + i - 1] == lines[i]; ++i)
                    ;
                if (i > count) {
                    if (place)
                        return 0
                    place = start
                }
            }
            return place
        }
        { line[NR] = $0 }
        END {
            count = split(edit, after, "\n")
            for (i = 1; i <= count; ++i) {
                if (after[i] !~ /^[+]/)
                    before[++beforeCount] = substr(after[i], 2)
                after[i] = substr(after[i], 2)
            }
            place = place_of(after, count)
            isFollowed = place != 0
            if (!isFollowed)
                place = place_of(before, beforeCount)
            if (!place || !beforeCount)
                exit 1
            for (i = 1; i < place; ++i)
                print line[i]
            for (i = 1; i <= count; ++i)
                print after[i]
            for (i = place + (isFollowed ? count : beforeCount); i <= NR; ++i)
                print line[i]
        }' "$1"
}

while IFS= read -r mark; do
    path=${mark#*: } path=${path% -->}
    mkdir -p "$folder/$(dirname -- "$path")"
    case $mark in
    "<!-- new file: "*)
        block "$mark" >"$folder/$path"
        if [ -e "$root/$path" ] && ! cmp -s "$folder/$path" "$root/$path"; then
            echo "$page: $path already exists, with other content" >&2
            rm "$folder/$path"
            exit 1
        fi
        ;;
    *)
        block "$mark" | edited "$root/$path" >"$folder/$path" || {
            echo "$page: the lines of the edit of $path are not in the file, or more than once" >&2
            rm "$folder/$path"
            exit 1
        }
        ;;
    esac
done < <(grep -E '^<!-- (new file|edit): .* -->$' "$page")
block "<!-- typed -->" >"$folder/typed"
block "<!-- shown -->" >"$folder/shown"
