#!/usr/bin/env bash
# Holds the code to the graph of rooms written in README.md (its ```rooms block, one line
# "room: rooms it uses" each): the build makes each room use exactly the rooms the graph
# gives it, no source or test includes a room that is not beneath its own, and only the
# desktop room and the programs include Qt.
# Usage: check_layers.sh SOURCE_DIR BUILT_GRAPH (the file the build writes, in the same form).
set -uo pipefail
root=$1
built=$2
failed=0
complain() {
    echo "layers: $*" >&2
    failed=1
}

declare -A uses
graph=$(awk '/^```rooms$/ { inside = 1; next } inside && /^```/ { exit } inside' "$root/README.md")
if [ -z "$graph" ]; then
    echo "layers: README.md has no \`\`\`rooms block" >&2
    exit 1
fi
while IFS= read -r line; do
    room=${line%%:*}
    uses[$room]=$(echo ${line#*:})
done <<<"$graph"
for room in "${!uses[@]}"; do
    for used in ${uses[$room]}; do
        [ -n "${uses[$used]+set}" ] || complain "README.md: $room uses $used, which is no room"
    done
done

# A room with every room beneath it, as " a b c ".
declare -A sees
for room in "${!uses[@]}"; do
    todo=("$room")
    seen=" "
    while [ ${#todo[@]} -gt 0 ]; do
        next=${todo[0]}
        todo=("${todo[@]:1}")
        [[ $seen == *" $next "* ]] && continue
        seen+="$next "
        for used in ${uses[$next]-}; do todo+=("$used"); done
    done
    sees[$room]=$seen
done
for room in "${!uses[@]}"; do
    for used in ${uses[$room]}; do
        [[ ${sees[$used]-} == *" $room "* ]] && complain "README.md: $room lies beneath itself"
    done
done

# The build uses the rooms the graph gives, no more and no fewer.
sorted() { tr ' ' '\n' <<<"$1" | sed '/^$/d' | sort | tr '\n' ' '; }
declare -A built_uses
while IFS= read -r line; do
    [ -n "$line" ] || continue
    built_uses[${line%%:*}]=$(echo ${line#*:})
done <"$built"
for room in "${!uses[@]}"; do
    if [ -z "${built_uses[$room]+set}" ]; then
        complain "the build has no room $room"
    elif [ "$(sorted "${uses[$room]}")" != "$(sorted "${built_uses[$room]}")" ]; then
        complain "the build lets $room use '${built_uses[$room]}', README.md '${uses[$room]}'"
    fi
done
for room in "${!built_uses[@]}"; do
    [ -n "${uses[$room]+set}" ] || complain "the build has room $room, which README.md has not"
done

# Every #include of a room names one that the including file's room sees.
check_includes() {
    local folder=$1 room=$2 file number text target
    while IFS=: read -r file number text; do
        target=$(sed -E 's/^[[:space:]]*#[[:space:]]*include[[:space:]]*"//; s/".*//' <<<"$text")
        if [[ $folder == src/* && $target == ../* ]]; then
            complain "$file:$number: $target climbs out of the include path"
            continue
        fi
        while [[ $target == ../* ]]; do target=${target#../}; done
        target=${target%%/*}
        [ -n "${uses[$target]+set}" ] || continue
        [[ ${sees[$room]} == *" $target "* ]] ||
            complain "$file:$number: $room includes $target, which is not beneath it"
    done < <(grep -rnE '^[[:space:]]*#[[:space:]]*include[[:space:]]*"' "$folder" \
        --include='*.h' --include='*.cpp' --include='*.in')
}
cd "$root"
for folder in src/*/; do
    room=$(basename "$folder")
    if [ -z "${uses[$room]+set}" ]; then
        complain "src/$room is no room of README.md's graph"
        continue
    fi
    check_includes "src/$room" "$room"
    [ "$room" = ui ] || [ "$room" = app ] && continue
    while IFS=: read -r file number _; do
        [ -n "$file" ] && complain "$file:$number: only the desktop and the programs know Qt"
    done <<<"$(grep -rnE '^[[:space:]]*#[[:space:]]*include[[:space:]]*<Q' "src/$room")"
done
for folder in tests/*/; do
    room=$(basename "$folder")
    [ -n "${uses[$room]+set}" ] && check_includes "tests/$room" "$room"
done

exit $failed
