# OpenPegasus: MOF compiled into its repository by its own tools, online where the server runs.
# Sourced, not run.
# shellcheck shell=sh disable=SC2046,SC2086,SC2154

interop=root/PG_InterOp

# Layouts: binaries, repository directory, its name, directories that may hold the configuration and
# the providers.
pegasus_find() {
  if [ -n "${PEGASUS_HOME:-}" ]; then
    pegasus_try "$PEGASUS_HOME/bin" "$PEGASUS_HOME" "$PEGASUS_HOME" "$PEGASUS_HOME/lib" && return 0
    fail "PEGASUS_HOME names $root$PEGASUS_HOME, which has neither a repository nor bin/cimserver; correct or unset it"
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
  pegasus_record=$pegasus_state/corvane.record
  pegasus_daemon=$(first_of -f "${pegasus_binaries%bin}sbin/cimserver" "$pegasus_binaries/cimserver") || pegasus_daemon=
  [ -d "$root$pegasus_repository" ] || { [ -d "$root$pegasus_configuration" ] && [ -n "$pegasus_daemon" ]; } || return 1
  pegasus_provider_places=$(expand "$@")
}

pegasus_tool() { first_of -x "$pegasus_binaries/$1" "${pegasus_binaries%bin}sbin/$1"; }

pegasus_check_tools() {
  advice="install the broker completely first"
  [ -n "$pegasus_daemon" ] || fail "OpenPegasus is there by half: no cimserver in $root$pegasus_binaries; $advice"
  need_directory "$pegasus_repository" "OpenPegasus is there by half" "$advice"
  for tool in cimmof cimmofl cimprovider cimcli; do
    pegasus_tool "$tool" >/dev/null || fail "OpenPegasus is there by half: no $tool in $root$pegasus_binaries; $advice"
  done
  need_writable "$pegasus_state"
  # The tools talk to whatever server runs.
  ! pegasus_runs || [ "$("$root$(pegasus_tool cimprovider)" -l | tr -d ' ' | sort)" = "$(pegasus_all_modules | sort)" ] ||
    fail "the OpenPegasus that runs does not serve $root$pegasus_repository; stop it, start this one's cimserver, then run this again"
  [ "$1" = install ] || pegasus_need_server
}

pegasus_runs() { "$root$(pegasus_tool cimprovider)" -l >/dev/null 2>&1; }

# Whether the repository has the class's file, which is named CLASS.PARENT.
pegasus_has_class() {
  for path in "$root$pegasus_repository/root#cimv2/classes/$1".*; do
    [ ! -e "$path" ] || return 0
  done
  return 1
}

# pegasus_modules UNIT...: their modules, by what is compiled for them.
pegasus_modules() {
  for unit; do
    sed -n '/^instance of PG_ProviderModule /,/^}/s/^   Name = "\(.*\)";$/\1/p' "$root$data/pegasus/$unit.mof"
  done
}

# The index of registered instances has a line "0 hash offset size path" for each; "1 ..." is a deleted one.
pegasus_all_modules() {
  file=$root$pegasus_repository/root#PG_InterOp/instances/PG_ProviderModule.idx
  [ ! -f "$file" ] || sed -n 's/^0 .*\.Name="\(.*\)"$/\1/p' "$file"
}

pegasus_registered_modules() {
  for module in $(pegasus_modules "$@"); do
    ! is_listed "$module" $(pegasus_all_modules) || say "$module"
  done
}

# pegasus_servers CLASS: the modules that serve it.
pegasus_servers() {
  file=$root$pegasus_repository/root#PG_InterOp/instances/PG_ProviderCapabilities
  [ ! -f "$file.idx" ] || LC_ALL=C awk -v class="$1" '
    NR == FNR { if ($1 == "0") used[$3]; next }
    /^<INSTANCE / { reading = (position + 0) in used }
    /^<PROPERTY/ { split($0, part, "\""); name = part[2] }
    /^<VALUE>/ { value[name] = substr($0, 8, length($0) - 15) }
    /^<\/INSTANCE>/ && reading && tolower(value["ClassName"]) == tolower(class) { print value["ProviderModuleName"] }
    { position += length($0) + 1 }' "$file.idx" "$file.instances"
}

# pegasus_owner CLASS: the other agent's module that serves it. A declaration of the computer system without our
# description is another agent's, too.
pegasus_owner() {
  for module in $(pegasus_servers "$1"); do
    is_listed "$module" $(pegasus_modules corvane-computersystem corvane-cpu) || { say "module $module" && return 0; }
  done
  [ "$1" = "$system_class" ] && pegasus_has_class "$1" || return 1
  description=$(sed -n 's/^ Description("\(.*\)")\]$/\1/p' "$root$data/schema/corvane-computersystem.mof")
  ! grep -qF "$description" "$root$pegasus_repository/root#cimv2/classes/$1".* || return 1
  say "$root$pegasus_repository"
}

# providerDir as configured; its default depends on how the broker was built.
pegasus_provider_directory() {
  for file in cimserver_planned.conf cimserver_current.conf; do
    [ -f "$root$pegasus_configuration/$file" ] || continue
    directory=$(sed -n 's/^providerDir=\([^:]*\).*/\1/p' "$root$pegasus_configuration/$file" | head -n 1)
    case $directory in
      '') ;;
      /*) say "$directory" && return 0 ;;
      *) say "$pegasus_state/$directory" && return 0 ;;
    esac
  done
  set -- $pegasus_provider_places
  [ $# -eq 0 ] || say "$1"
}

pegasus_check_install() {
  find_libraries "$pegasus_daemon"
  pegasus_providers=$(pegasus_provider_directory)
  [ -n "$pegasus_providers" ] || fail "found no provider directory of OpenPegasus; set providerDir with cimconfig"
  need_directory "$pegasus_providers" "OpenPegasus has no provider directory" "make it, or set providerDir with cimconfig"
  check_links "$pegasus_providers"
  for class in $(parents_of "$data/schema/corvane-cpu.mof") $(parents_of "$data/schema/corvane-computersystem.mof"); do
    pegasus_has_class "$class" ||
      fail "the DMTF schema in $root$pegasus_repository/root#cimv2 has no $class; compile CIM schema 2.22 or later into root/cimv2, then run this again"
  done
  for unit in $units; do
    pegasus_has_registration "$unit" || [ -z "$(pegasus_registered_modules "$unit")" ] || pegasus_need_server
  done
}

pegasus_need_server() {
  pegasus_runs || fail "OpenPegasus does not run, and only the server can take registrations back; start cimserver, then run this again"
}

# The record has the checksum of each compiled file, so that no file is compiled twice.
pegasus_mark() { say "$(cksum <"$root$1") $1"; }
pegasus_is_compiled() { grep -qsxF "$(pegasus_mark "$1")" "$root$pegasus_record"; }

# pegasus_compile NAMESPACE FILE: through the server if it runs, else into the repository. Classes that another
# version compiled are updated.
pegasus_compile() {
  if pegasus_runs; then
    step "compile $2 into $1" "$root$(pegasus_tool cimmof)" -uc -aV -n"$1" "$root$2"
  else
    step "compile $2 into $1 (the server does not run)" \
      "$root$(pegasus_tool cimmofl)" -uc -aV -R"$root$pegasus_state" -Nrepository -n"$1" "$root$2"
  fi
  $dry_run || pegasus_remember "$2"
}

pegasus_remember() {
  {
    grep -sv " $1$" "$root$pegasus_record" || :
    pegasus_mark "$1"
  } >"$root$pegasus_record.new"
  mv "$root$pegasus_record.new" "$root$pegasus_record"
}

pegasus_lacks_module() {
  for module in $(pegasus_modules "$1"); do
    is_listed "$module" $(pegasus_all_modules) || { say "module $module is not registered" && return 0; }
  done
  return 1
}

pegasus_lacks_class() {
  for class in $(classes_of "$data/schema/$1.mof"); do
    pegasus_has_class "$class" || { say "class $class is missing" && return 0; }
  done
  return 1
}

pegasus_has_registration() { pegasus_is_compiled "$data/pegasus/$1.mof" && ! pegasus_lacks_module "$1" >/dev/null; }
pegasus_has_schema() { pegasus_is_compiled "$data/schema/$1.mof" && ! pegasus_lacks_class "$1" >/dev/null; }

# A file that is recorded with another checksum; what was compiled by hand has none.
pegasus_is_outdated() {
  for file in "$data/pegasus/$1.mof" "$data/schema/$1.mof"; do
    if ! pegasus_is_compiled "$file" && grep -qs " $file$" "$root$pegasus_record"; then
      say "another version of $file is compiled"
      return 0
    fi
  done
  return 1
}

# pegasus_problem UNIT...: what their registration lacks; nothing if it is complete.
pegasus_problem() {
  for unit; do
    if pegasus_lacks_module "$unit" || pegasus_lacks_class "$unit" || pegasus_is_outdated "$unit"; then return; fi
  done
  ! library=$(missing_library "$(pegasus_provider_directory)") || say "$(pegasus_provider_directory) has no $library"
}

# pegasus_remove_modules UNIT...
pegasus_remove_modules() {
  pegasus_cimprovider=$root$(pegasus_tool cimprovider)
  for module in $(pegasus_registered_modules "$@"); do
    # Disabling ends the module's process; a module that is disabled already refuses.
    $dry_run || "$pegasus_cimprovider" -d -m "$module" >/dev/null 2>&1 || :
    step "remove module $module" "$pegasus_cimprovider" -r -m "$module"
  done
}

# The registration is compiled first: it shows that an interrupted installation is ours.
pegasus_install() {
  link_libraries "$pegasus_providers"
  for unit in $units; do
    if ! pegasus_has_registration "$unit"; then
      # The compiler does not replace an instance.
      pegasus_remove_modules "$unit"
      pegasus_compile "$interop" "$data/pegasus/$unit.mof"
    fi
    pegasus_has_schema "$unit" || pegasus_compile "$namespace" "$data/schema/$unit.mof"
  done
}

pegasus_is_registered() {
  for class in $(classes_of "$data/schema/corvane-cpu.mof"); do
    ! pegasus_has_class "$class" || return 0
  done
  [ -n "$(pegasus_registered_modules corvane-computersystem corvane-cpu)$(our_links $(pegasus_provider_directory))" ]
}

pegasus_remove() {
  pegasus_remove_modules corvane-computersystem corvane-cpu
  # Associations come last in the file, so backwards they go before what they refer to.
  for class in $(for unit in $units; do classes_of "$data/schema/$unit.mof"; done | sed '1!G;h;$!d'); do
    ! pegasus_has_class "$class" || step "remove class $class" "$root$(pegasus_tool cimcli)" dc "$class" -n "$namespace"
  done
  unlink_libraries $(pegasus_provider_directory)
  $dry_run || rm -f "$root$pegasus_record"
}
