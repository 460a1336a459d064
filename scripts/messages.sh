# Compares the messages in docs/operations.md with those of the sources. Sourced after checks.sh.
# shellcheck shell=bash disable=SC2154

# literals FILE...: the sources, with adjacent string literals joined, runs of blanks as one, and quotes in texts as
# apostrophes.
literals() {
  sed "s|^ *//.*||; s|  // .*||; s/'\"'//g" "$@" | tr -s '[:space:]' ' ' | sed "s/\" \"//g; s/\\\\\"/'/g"
}

# messages TITLE: the texts in backticks in the first column of tables, from that section on.
messages() {
  # shellcheck disable=SC2016
  sed -n "/^## $1/,\$p" docs/operations.md | sed -n 's/^| \(`.*`[^|]*\) | .*/\1/p' | grep -o '`[^`]*`' |
    tr -d '\`' | tr '"' "'" | tr -s ' '
}

# The fixed words of each documented message must be in a source. Angle brackets and ellipses stand for variable parts;
# of words between slashes the message has one.
check_documented_messages() {
  local sources texts words status=0
  mapfile -t sources < <(tracked 'model/*' 'factory/*' 'providers/*' 'companion/*' 'platform/*.cpp' 'platform/*.h' 'cmpi/*.cpp' \
    'host/*.cpp' 'host/*.h' 'packaging/register/*')
  texts=$(literals "${sources[@]}" | tr '"' "'")
  while IFS= read -r words; do
    [[ $texts == *"$words"* ]] || { echo "docs/operations.md: no source says \"$words\"" && status=1; }
  done < <(messages Messages | sed -E 's/<[^>]*>|\.\.\./\n/g; s/(^| )[^ ]*\/[^ ]*( |$)/\n/g' |
    sed -E "s/^[ ,;:'.]+//; s/[ ,;:']+$//" | grep -E '[A-Za-z]{2}' | sort -u)
  return $status
}

# Each error text of the product and the companion must have a row.
check_undocumented_messages() {
  local sources patterns text pattern status=0
  mapfile -t sources < <(tracked 'model/*' 'factory/*' 'providers/*' 'companion/*.cpp' 'companion/*.h')
  mapfile -t patterns < <(messages 'Messages of the library' | sed -E 's/<[^>]*>|\.\.\.|[^ ]*\/[^ ]*/*/g' |
    sed 's/\.$//' | grep -E '[A-Za-z]{4}')
  while IFS= read -r text; do
    for pattern in "${patterns[@]}"; do
      # shellcheck disable=SC2053
      [[ $text == $pattern ]] && continue 2
    done
    echo "\"$text\" has no row in docs/operations.md" && status=1
  done < <(literals "${sources[@]}" | grep -oE '"[^"]*"' | sed 's/^"//; s/[ .:]*"$//' | grep ' ' |
    grep -E "[Ff]ailed|Can't|[Ee]mpty|NULL|^\**No |Error|Exception|one key|not known" | sort -u)
  return $status
}
