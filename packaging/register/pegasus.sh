# OpenPegasus: MOF compiled into its repository by its own tools, online where the server runs.
# Sourced, not run.
# shellcheck shell=sh disable=SC2154

interop=root/PG_InterOp

# Layouts: binaries, repository directory, its name, directories that may hold the configuration and
# the providers.
pegasus_find() {
  if [ -n "${PEGASUS_HOME:-}" ] && pegasus_try "$PEGASUS_HOME/bin" "$PEGASUS_HOME" "$PEGASUS_HOME" "$PEGASUS_HOME/lib"; then
    return 0
  fi
  for name in Pegasus pegasus tog-pegasus; do
    for pegasus_base in '' /usr/local; do
      if pegasus_try "${pegasus_base:-/usr}/bin" "$pegasus_base/var/lib/$name" "$pegasus_base/etc/$name" \
        "${pegasus_base:-/usr}/lib*/$name/providers" "${pegasus_base:-/usr}/lib/*/$name/providers"; then
        return 0
      fi
    done
  done
  for pegasus_base in /opt/tog-pegasus /opt/pegasus; do
    if pegasus_try "$pegasus_base/bin" "$pegasus_base" "$pegasus_base" "$pegasus_base/providers/lib" "$pegasus_base/lib"; then
      return 0
    fi
    if pegasus_try "$pegasus_base/bin" "/var$pegasus_base" "/etc$pegasus_base" "$pegasus_base/providers/lib" "$pegasus_base/lib"; then
      return 0
    fi
  done
  return 1
}

# pegasus_try BINARIES STATE CONFIGURATION PROVIDERS...: whether the broker is there, if only by half.
pegasus_try() {
  pegasus_binaries=$1
  pegasus_state=$2
  pegasus_configuration=$3
  shift 3
  pegasus_repository=$pegasus_state/repository
  pegasus_daemon=$(first_of -f "${pegasus_binaries%bin}sbin/cimserver" "$pegasus_binaries/cimserver") || pegasus_daemon=
  [ -d "$root$pegasus_repository" ] || { [ -d "$root$pegasus_configuration" ] && [ -n "$pegasus_daemon" ]; } || return 1
  pegasus_provider_places=$(expand "$@")
}

pegasus_tool() { first_of -x "$pegasus_binaries/$1" "${pegasus_binaries%bin}sbin/$1"; }

pegasus_check_tools() {
  advice="install the broker completely first"
  [ -n "$pegasus_daemon" ] || fail "OpenPegasus is there by half: no cimserver in $root$pegasus_binaries; $advice"
  need_directory "$pegasus_repository" "OpenPegasus is there by half" "$advice"
  for tool in "$@"; do
    pegasus_tool "$tool" >/dev/null || fail "OpenPegasus is there by half: no $tool in $root$pegasus_binaries; $advice"
  done
  need_writable /var/lib/corvane
}

pegasus_runs() {
  pegasus_provider_tool=$(pegasus_tool cimprovider) && "$root$pegasus_provider_tool" -l >/dev/null 2>&1
}

# has_class CLASS: whether the repository has its file, which is named CLASS.PARENT.
pegasus_has_class() {
  for path in "$root$pegasus_repository/root#cimv2/classes/$1".*; do
    [ ! -e "$path" ] || return 0
  done
  return 1
}

# providerDir as configured; its default depends on how the broker was built.
pegasus_provider_directory() {
  for file in cimserver_planned.conf cimserver_current.conf; do
    [ -f "$root$pegasus_configuration/$file" ] || continue
    directory=$(sed -n 's/^providerDir=\([^:]*\).*/\1/p' "$root$pegasus_configuration/$file" | head -n 1)
    case $directory in
      '') ;;
      /*) printf '%s\n' "$directory" && return 0 ;;
      *) printf '%s\n' "$pegasus_state/$directory" && return 0 ;;
    esac
  done
  # shellcheck disable=SC2086
  set -- $pegasus_provider_places
  [ $# -eq 0 ] || printf '%s\n' "$1"
}

pegasus_check_install() {
  check_product pegasus/corvane-cpu.mof pegasus/corvane-computersystem.mof
  pegasus_check_tools cimmof cimmofl cimprovider
  find_libraries "$pegasus_daemon"
  pegasus_providers=$(pegasus_provider_directory)
  [ -n "$pegasus_providers" ] || fail "found no provider directory of OpenPegasus; set providerDir with cimconfig"
  need_directory "$pegasus_providers" "OpenPegasus has no provider directory" "make it, or set providerDir with cimconfig"
  check_links pegasus "$pegasus_providers"
  pegasus_check_schema
  for class in $(classes_of "$data/schema/corvane-cpu.mof"); do
    ! pegasus_has_class "$class" || is_recorded pegasus "class $class" ||
      fail "$class is in $root$pegasus_repository and was not put there by this program; remove its agent's registration and the class first"
  done
  pegasus_units='corvane-computersystem corvane-cpu'
  pegasus_system_foreign=false
  if pegasus_has_class "$system_class" && ! is_recorded pegasus "class $system_class"; then
    pegasus_system_foreign=true
    pegasus_units=corvane-cpu
  fi
}

pegasus_check_schema() {
  # Other forms of the repository (one database file) cannot be looked into; the compiler will tell.
  [ -d "$root$pegasus_repository/root#cimv2/classes" ] || return 0
  for class in $(parents_of "$data/schema/corvane-cpu.mof") $(parents_of "$data/schema/corvane-computersystem.mof"); do
    pegasus_has_class "$class" ||
      fail "the DMTF schema in $root$pegasus_repository/root#cimv2 has no $class; compile CIM schema 2.22 or later into root/cimv2, then run this again"
  done
}

# pegasus_compile NAMESPACE FILE: through the server where it runs, else into the repository. Classes
# that an earlier version compiled are updated.
pegasus_compile() {
  pegasus_update=
  if [ "$1" = "$namespace" ] && pegasus_has_class "$(classes_of "$2" | tail -n 1)"; then
    pegasus_update='-uC -aV'
  fi
  # shellcheck disable=SC2086
  if pegasus_runs; then
    step "compile $2 into $1" "$root$(pegasus_tool cimmof)" $pegasus_update -n"$1" "$root$2"
  else
    step "compile $2 into $1 (the server does not run)" \
      "$root$(pegasus_tool cimmofl)" $pegasus_update -R"$root$pegasus_state" -Nrepository -n"$1" "$root$2"
  fi
}

# What is compiled is remembered with its checksum: an equal one is not compiled again.
pegasus_compile_once() {
  mark="compiled $1 $2 $(cksum <"$root$2" | tr ' ' -)"
  if is_recorded pegasus "$mark"; then return 0; fi
  changed=true
  pegasus_compile "$1" "$2"
  $dry_run || sed -i "\|^compiled $1 $2 |d" "$root$(record_of pegasus)"
  record pegasus "$mark"
}

pegasus_modules_of() { sed -n '/^instance of PG_ProviderModule /,/^}/s/^   Name = "\(.*\)";$/\1/p' "$root$1"; }

pegasus_install() {
  changed=false
  link_libraries pegasus "$pegasus_providers"
  for unit in $pegasus_units; do
    for class in $(classes_of "$data/schema/$unit.mof"); do record pegasus "class $class"; done
    for module in $(pegasus_modules_of "$data/pegasus/$unit.mof"); do record pegasus "module $module"; done
    pegasus_compile_once "$namespace" "$data/schema/$unit.mof"
    pegasus_compile_once "$interop" "$data/pegasus/$unit.mof"
  done
  ! $pegasus_system_foreign || say "leave $system_class to its agent"
  if $changed; then
    $dry_run || say "pegasus: registered"
  else
    say "pegasus: registered already"
  fi
}

pegasus_check_remove() {
  [ -f "$root$(record_of pegasus)" ] || return 0
  pegasus_check_tools cimprovider cimcli
  pegasus_runs || fail "OpenPegasus does not run, and only the server can take registrations back; start cimserver, then run this again"
}

# Whether a provider that is not ours serves the class, once our modules are gone.
pegasus_system_is_served() {
  "$root$(pegasus_tool cimcli)" ei PG_ProviderCapabilities -n "$interop" | grep -q "\"$system_class\""
}

pegasus_remove() {
  if [ ! -f "$root$(record_of pegasus)" ]; then
    say "pegasus: not registered by this program; nothing to remove"
    return 0
  fi
  pegasus_cimprovider=$root$(pegasus_tool cimprovider)
  for module in $(recorded pegasus module); do
    "$pegasus_cimprovider" -l | grep -qw "$module" || continue
    # Disabling ends the module's process; a module that is disabled already refuses.
    $dry_run || "$pegasus_cimprovider" -d -m "$module" >/dev/null 2>&1 || :
    step "remove module $module" "$pegasus_cimprovider" -r -m "$module"
  done
  # Associations come last in the file, so backwards they go before what they refer to.
  for class in $(recorded pegasus class | sed '1!G;h;$!d'); do
    if [ "$class" = "$system_class" ] && pegasus_system_is_served; then
      say "leave $class to the agent that registered it"
    elif pegasus_has_class "$class" || [ ! -d "$root$pegasus_repository/root#cimv2/classes" ]; then
      step "remove class $class" "$root$(pegasus_tool cimcli)" dc "$class" -n "$namespace"
    fi
  done
  take_back pegasus
  forget pegasus
  $dry_run || say "pegasus: removed"
}

pegasus_status() {
  if [ ! -f "$root$(record_of pegasus)" ]; then
    say "pegasus: not registered"
    return 3
  fi
  if lost=$(missing pegasus); then
    say "pegasus: incomplete, $lost is missing; run corvcpu-register install"
    return 1
  fi
  # The provider library's own registration is the last thing that install compiles.
  if [ -z "$(recorded pegasus "compiled $interop $data/pegasus/corvane-cpu.mof")" ]; then
    say "pegasus: incomplete, the registration is not compiled; run corvcpu-register install"
    return 1
  fi
  if is_recorded pegasus "class $system_class"; then
    say "pegasus: registered, with $system_class"
  else
    say "pegasus: registered, without $system_class, which is left to its agent"
  fi
}
