# SFCB: files in its staging directory, from which sfcbrepos builds the repository. Sourced, not run.
# shellcheck shell=sh disable=SC2154

sfcb_find() {
  for sfcb_layout in /usr:/etc:/var /usr/local:/usr/local/etc:/usr/local/var /opt/sfcb:/opt/sfcb/etc:/opt/sfcb/var; do
    sfcb_prefix=${sfcb_layout%%:*}
    sfcb_state=${sfcb_layout##*:}/lib/sfcb
    sfcb_etc=${sfcb_layout#*:}
    sfcb_config=${sfcb_etc%:*}/sfcb/sfcb.cfg
    sfcb_daemon=$(first_of -f "$sfcb_prefix/sbin/sfcbd" "$sfcb_prefix/bin/sfcbd") || sfcb_daemon=
    if [ -f "$root$sfcb_config" ] || [ -n "$sfcb_daemon" ] || [ -d "$root$sfcb_state" ]; then
      sfcb_stage=$sfcb_state/stage
      sfcb_mofs=$sfcb_stage/mofs/$namespace
      sfcb_regs=$sfcb_stage/regs
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
  # The tool names the directory of the DMTF schema where it is a script.
  sfcb_schema=$(sed -n 's|^schemadir=\(/[^ $]*\)$|\1|p' "$root$sfcb_repos" | head -n 1)
  [ -z "$sfcb_schema" ] || need_directory "$sfcb_schema" "SFCB has no DMTF schema" "install it, then run this again"
  need_writable "$sfcb_mofs"
  need_writable "$sfcb_regs"
  need_writable /var/lib/corvane
}

# sfcb_others PATTERN FILE...: the first file that has the pattern and is not of this product.
sfcb_others() {
  pattern=$1
  shift
  for path; do
    case $path in
      */corvane-cpu.reg | */corvane-computersystem.reg | */corvane-cpu.mof | */corvane-computersystem.mof) continue ;;
    esac
    if [ -f "$path" ] && grep -qiE "$pattern" "$path"; then
      printf '%s\n' "$path"
      return 0
    fi
  done
  return 1
}

# sfcb_owner CLASS: the file by which another agent serves or declares the class.
sfcb_owner() {
  sfcb_others "^[[:blank:]]*\[$1\]" "$root$sfcb_regs"/* || sfcb_others "^[[:blank:]]*class[[:blank:]]+$1([[:blank:]:{]|$)" "$root$sfcb_mofs"/*
}

# Providers that were written into the built registration without being staged.
sfcb_owner_built() {
  is_recorded sfcb "file $sfcb_regs/corvane-computersystem.reg" ||
    sfcb_others "^[[:blank:]]*\[$1\]" "$root$sfcb_state/registration/providerRegister"
}

sfcb_provider_directories() {
  sed -n 's/^[[:blank:]]*providerDirs[[:blank:]]*:[[:blank:]]*//p' "$root$sfcb_config" | head -n 1
}

# Sets what install goes by: $sfcb_units, $sfcb_links.
sfcb_check_install() {
  check_product sfcb/corvane-cpu.reg sfcb/corvane-computersystem.reg
  sfcb_check_tools
  find_libraries "$sfcb_daemon"
  for class in $(classes_of "$data/schema/corvane-cpu.mof"); do
    if owner=$(sfcb_owner "$class"); then
      fail "$class belongs to another agent: $owner names it; remove that agent's registration first"
    fi
  done
  sfcb_units='corvane-computersystem corvane-cpu'
  sfcb_system_owner=$(sfcb_owner "$system_class" || sfcb_owner_built "$system_class") || sfcb_system_owner=
  [ -z "$sfcb_system_owner" ] || sfcb_units=corvane-cpu
  for unit in $sfcb_units; do
    sfcb_check_place "$sfcb_mofs/$unit.mof" "$data/schema/$unit.mof"
    sfcb_check_place "$sfcb_regs/$unit.reg" "$data/sfcb/$unit.reg"
  done
  sfcb_directories=$(sfcb_provider_directories)
  [ -n "$sfcb_directories" ] || fail "$root$sfcb_config has no line \"providerDirs:\"; give it one with $library_directory"
  sfcb_links=$library_directory
  # shellcheck disable=SC2086
  if ! is_listed "$library_directory" $sfcb_directories; then
    sfcb_links=$(first_of -d $sfcb_directories) ||
      fail "none of the directories of \"providerDirs:\" in $root$sfcb_config exists; add $library_directory to the line"
    check_links sfcb "$sfcb_links"
  fi
}

# A staged file of our name is ours by record or by content.
sfcb_check_place() {
  [ ! -e "$root$1" ] || is_recorded sfcb "file $1" || cmp -s "$root$1" "$root$2" ||
    fail "$root$1 exists and was not staged by this program; move it away"
}

sfcb_rebuild() {
  step "run sfcbrepos" "$root$sfcb_repos" -f -s "$root$sfcb_stage" -r "$root$sfcb_state/registration"
}

sfcb_install() {
  changed=false
  fresh=true
  [ ! -f "$root$(record_of sfcb)" ] || fresh=false
  # Whatever an interrupted run left staged still has to be built.
  $fresh || ! is_recorded sfcb unfinished || changed=true
  link_libraries sfcb "$sfcb_links"
  for unit in $sfcb_units; do
    put sfcb "$data/schema/$unit.mof" "$sfcb_mofs/$unit.mof"
    put sfcb "$data/sfcb/$unit.reg" "$sfcb_regs/$unit.reg"
  done
  [ -z "$sfcb_system_owner" ] || say "leave $system_class to its agent ($sfcb_system_owner)"
  if ! $changed; then
    say "sfcb: registered already"
    return 0
  fi
  record sfcb unfinished
  if ! sfcb_rebuild; then
    if $fresh; then
      take_back sfcb
      forget sfcb
      fail "sfcbrepos failed, see above; everything was taken back. Repair SFCB's schema, then run this again"
    fi
    fail "sfcbrepos failed, see above; repair SFCB's schema, then run this again"
  fi
  $dry_run || sed -i '/^unfinished$/d' "$root$(record_of sfcb)"
  sfcb_say_end registered
}

sfcb_say_end() {
  if $dry_run; then return 0; fi
  say "sfcb: $1; restart sfcbd to make it count"
}

sfcb_check_remove() {
  [ -f "$root$(record_of sfcb)" ] || return 0
  sfcb_check_tools
}

sfcb_remove() {
  if [ ! -f "$root$(record_of sfcb)" ]; then
    say "sfcb: not registered by this program; nothing to remove"
    return 0
  fi
  kept=
  # An agent that registers the class without a declaration of its own needs ours.
  if sfcb_others "^[[:blank:]]*\[$system_class\]" "$root$sfcb_regs"/* >/dev/null &&
    ! sfcb_others "^[[:blank:]]*class[[:blank:]]+$system_class([[:blank:]:{]|$)" "$root$sfcb_mofs"/* >/dev/null; then
    kept=$sfcb_mofs/corvane-computersystem.mof
    say "leave $kept to the agent that registered $system_class"
  fi
  take_back sfcb
  forget sfcb
  sfcb_rebuild || fail "sfcbrepos failed, see above; the files are removed. Run sfcbrepos -f once it is repaired"
  sfcb_say_end removed
}

sfcb_status() {
  if [ ! -f "$root$(record_of sfcb)" ]; then
    say "sfcb: not registered"
    return 3
  fi
  if lost=$(missing sfcb); then
    say "sfcb: incomplete, $lost is missing; run corvcpu-register install"
    return 1
  fi
  if is_recorded sfcb unfinished; then
    say "sfcb: incomplete, sfcbrepos has not run; run corvcpu-register install"
    return 1
  fi
  if is_recorded sfcb "file $sfcb_regs/corvane-computersystem.reg"; then
    say "sfcb: registered, with $system_class"
  else
    say "sfcb: registered, without $system_class, which is left to its agent"
  fi
}
