# SFCB: files in its staging directory, from which sfcbrepos builds the repository. Sourced, not run.
# shellcheck shell=sh disable=SC2046,SC2086,SC2154

sfcb_find() {
  for sfcb_layout in /usr:/etc:/var /usr/local:/usr/local/etc:/usr/local/var /opt/sfcb:/opt/sfcb/etc:/opt/sfcb/var; do
    sfcb_prefix=${sfcb_layout%%:*}
    sfcb_state=${sfcb_layout##*:}/lib/sfcb
    sfcb_etc=${sfcb_layout#*:}
    sfcb_config=${sfcb_etc%:*}/sfcb/sfcb.cfg
    sfcb_daemon=$(first_of -f "$sfcb_prefix/sbin/sfcbd" "$sfcb_prefix/bin/sfcbd") || sfcb_daemon=
    if [ -f "$root$sfcb_config" ] || [ -n "$sfcb_daemon" ] || [ -d "$root$sfcb_state" ]; then
      sfcb_stage=$sfcb_state/stage
      sfcb_registration=$sfcb_state/registration
      return 0
    fi
  done
  return 1
}

sfcb_check_tools() {
  advice="install the broker completely first"
  need_file "$sfcb_config" "SFCB is there by half" "$advice"
  need_directory "$sfcb_stage" "SFCB is there by half" "$advice"
  [ -n "$sfcb_daemon" ] || fail "SFCB is there by half: no sfcbd in $root$sfcb_prefix/sbin; $advice"
  sfcb_repos=$(first_of -x "$sfcb_prefix/bin/sfcbrepos" "$sfcb_prefix/sbin/sfcbrepos") ||
    fail "SFCB is there by half: no sfcbrepos in $root$sfcb_prefix/bin; $advice"
  # The tool is a script that names the directory of the DMTF schema.
  # shellcheck disable=SC2016
  sfcb_schema=$(sed -n 's|^[[:blank:]]*cimschemadir=\(${DESTDIR}\)*\(/[^ $]*\)$|\2|p' "$root$sfcb_repos" | head -n 1)
  [ -z "$sfcb_schema" ] ||
    need_file "$sfcb_schema/CIM_Schema.mof" "SFCB has no DMTF schema" "install it, then run this again"
  need_writable "$sfcb_stage"
  need_writable "$sfcb_registration"
}

# sfcb_files UNIT...: seen from the staging directory.
sfcb_files() {
  for unit; do
    say "mofs/$namespace/$unit.mof regs/$unit.reg"
  done
}

# What a staged file is a copy of.
sfcb_source() {
  case $1 in *.mof) say "$data/schema/${1##*/}" ;; *) say "$data/sfcb/${1##*/}" ;; esac
}

# sfcbstage pipes a MOF file through a preprocessor that drops its comments.
without_comments() { sed -e '/^\/\//d' -e '/^$/d' "$1"; }
same_texts() { [ "$(without_comments "$1")" = "$(without_comments "$2")" ]; }

sfcb_all_files() { sfcb_files corvane-computersystem corvane-cpu; }

# The staged files of this product, of any version, also those that were staged by hand.
sfcb_staged() {
  for file in $(sfcb_all_files); do
    ! grep -qsE '^class HALDA_|location:[[:blank:]]*corvc' "$root$sfcb_stage/$file" || say "$file"
  done
}

# sfcb_others PATTERN FILE...: the first file that has the pattern and has no name of this product's.
sfcb_others() {
  pattern=$1
  shift
  # shellcheck disable=SC2013
  for path in $(grep -lsiE "$pattern" "$@"); do
    is_listed "${path#"$root$sfcb_stage/"}" $(sfcb_all_files) || { say "$path" && return 0; }
  done
  return 1
}

sfcb_registers() { sfcb_others "^[[:blank:]]*\[$1\]" "$root$sfcb_stage"/regs/*; }
sfcb_declares() { sfcb_others "^[[:blank:]]*class[[:blank:]]+$1([[:blank:]:{]|$)" "$root$sfcb_stage/mofs/$namespace"/*; }

# sfcb_built CLASS: the locations that serve the class in the registration that was built.
sfcb_built() {
  [ ! -f "$root$sfcb_registration/providerRegister" ] ||
    awk -v class="[$1]" '/^[ \t]*\[/ { on = tolower($1) == tolower(class) } on && $1 == "location:" { print $2 }' \
      "$root$sfcb_registration/providerRegister"
}

# sfcb_owner CLASS: the file by which another agent serves or declares the class, staged or not.
sfcb_owner() {
  if sfcb_registers "$1" || sfcb_declares "$1"; then return 0; fi
  for location in $(sfcb_built "$1"); do
    is_listed "$location" $libraries || { say "$root$sfcb_registration/providerRegister" && return 0; }
  done
  return 1
}

sfcb_provider_directories() {
  sed -n 's/^[[:blank:]]*providerDirs[[:blank:]]*:[[:blank:]]*//p' "$root$sfcb_config" | tail -n 1
}

# Sets $sfcb_links, the directory that the libraries are linked into.
sfcb_check_install() {
  find_libraries "$sfcb_daemon"
  for file in $(sfcb_all_files); do
    [ ! -e "$root$sfcb_stage/$file" ] || is_listed "$file" $(sfcb_staged) ||
      fail "$root$sfcb_stage/$file exists and is not of this product; move it away"
  done
  sfcb_directories=$(sfcb_provider_directories)
  [ -n "$sfcb_directories" ] || fail "$root$sfcb_config has no line \"providerDirs:\"; give it one with $library_directory"
  sfcb_links=$library_directory
  if ! is_listed "$library_directory" $sfcb_directories; then
    sfcb_links=$(first_of -d $sfcb_directories) ||
      fail "none of the directories of \"providerDirs:\" in $root$sfcb_config exists; add $library_directory to the line"
    check_links "$sfcb_links"
  fi
}

# sfcb_problem UNIT...: what their registration lacks; nothing if it is complete.
sfcb_problem() {
  for file in $(sfcb_files "$@"); do
    [ -f "$root$sfcb_stage/$file" ] || { say "$sfcb_stage/$file is missing" && return; }
    same_texts "$root$sfcb_stage/$file" "$root$(sfcb_source "$file")" ||
      { say "$sfcb_stage/$file is from another version" && return; }
  done
  for unit; do
    for class in $(classes_of "$data/schema/$unit.mof"); do
      { [ -n "$(sfcb_built "$class")" ] &&
        grep -qs "$class" "$root$sfcb_registration/repository/$namespace"/classSchemas*; } ||
        { say "sfcbrepos has not run" && return; }
    done
  done
  ! library=$(missing_library $(sfcb_provider_directories)) || say "no directory of \"providerDirs:\" has $library"
}

# sfcb_restage RUN STAGE: RUN is "step", or "quietly" for the copy of the staging directory.
sfcb_restage() {
  for file in $sfcb_add; do
    "$1" "copy $(sfcb_source "$file") to $sfcb_stage/$file" copy_file "$root$(sfcb_source "$file")" "$2/$file"
  done
  for file in $sfcb_drop; do
    "$1" "remove $sfcb_stage/$file" rm "$2/$file"
  done
}

quietly() {
  shift
  "$@"
}

# sfcbrepos leaves an empty repository if it fails. It therefore works on copies, which replace the repository
# only after success. The staging directory changes last.
sfcb_rebuild() {
  work=$root$sfcb_registration/corvane.new
  rm -rf "$work"
  mkdir -p "$work"
  cp -a "$root$sfcb_stage" "$work/stage"
  for part in repository providerRegister; do
    [ ! -e "$root$sfcb_registration/$part" ] || cp -a "$root$sfcb_registration/$part" "$work"
  done
  sfcb_restage quietly "$work/stage"
  if ! DESTDIR=$root "$root$sfcb_repos" -f -s "$work/stage" -r "$work"; then
    rm -rf "$work"
    fail "sfcbrepos failed, see above; nothing was changed. Repair what it complains about, then run this again"
  fi
  for part in repository providerRegister; do
    rm -rf "$root$sfcb_registration/$part.previous"
    [ ! -e "$root$sfcb_registration/$part" ] ||
      mv "$root$sfcb_registration/$part" "$root$sfcb_registration/$part.previous"
    mv "$work/$part" "$root$sfcb_registration/$part"
  done
  rm -rf "$work"
}

sfcb_change() {
  step "build the repository with sfcbrepos" sfcb_rebuild
  sfcb_restage step "$root$sfcb_stage"
}

sfcb_say_restart() { $dry_run || say "sfcb: restart sfcbd; it still uses the old registration"; }

sfcb_install() {
  [ -n "$(sfcb_problem $units)" ] || return 0
  sfcb_add=$(sfcb_files $units)
  sfcb_drop=
  sfcb_change
  link_libraries "$sfcb_links"
  sfcb_say_restart
}

sfcb_is_registered() {
  sfcb_staged | grep -qv computersystem.mof ||
    grep -qsE '^[[:blank:]]*location:[[:blank:]]*corvc' "$root$sfcb_registration/providerRegister"
}

sfcb_remove() {
  sfcb_add=
  sfcb_drop=$(sfcb_staged)
  # An agent that registers the class without a declaration of its own needs ours.
  if sfcb_registers "$system_class" >/dev/null && ! sfcb_declares "$system_class" >/dev/null; then
    sfcb_drop=$(sfcb_staged | grep -v computersystem.mof)
  fi
  sfcb_change
  unlink_libraries $(sfcb_provider_directories)
  sfcb_say_restart
}
