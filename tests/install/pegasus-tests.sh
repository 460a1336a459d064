# corvcpu-register with OpenPegasus. Sourced by register-test.
# shellcheck shell=bash disable=SC2001,SC2154

repository="/opt/pegasus/repository"
classes="$repository/root#cimv2/classes"

pegasus_links="link /opt/pegasus/lib/libcorvcpuprofileprovider.so to /usr/lib/x86_64-linux-gnu/cmpi/libcorvcpuprofileprovider.so
link /opt/pegasus/lib/libcorvcomputersystemprovider.so to /usr/lib/x86_64-linux-gnu/cmpi/libcorvcomputersystemprovider.so"
pegasus_system="compile $share/pegasus/corvane-computersystem.mof into root/PG_InterOp
compile $share/schema/corvane-computersystem.mof into root/cimv2"
pegasus_cpu="compile $share/pegasus/corvane-cpu.mof into root/PG_InterOp
compile $share/schema/corvane-cpu.mof into root/cimv2"
pegasus_registered="pegasus: registered, with HALDA_ComputerSystem"
pegasus_without="pegasus: registered, without HALDA_ComputerSystem, which is left to its agent"
pegasus_removals="remove module CorvaneComputerSystemModule
remove module CorvaneCPUModule
remove module CorvaneCPUCacheModule
remove class HALDA_CPUElementCapabilities
remove class HALDA_CPUCoreAssociatedCacheMemory
remove class HALDA_CPUAssociatedCacheMemory
remove class HALDA_CPUConcreteComponent
remove class HALDA_CPUSystemDevice
remove class HALDA_CPUProcessorCapabilities
remove class HALDA_CPUMemory
remove class HALDA_CPUProcessorCore
remove class HALDA_CPUProcessor
remove class HALDA_ComputerSystem
remove /opt/pegasus/lib/libcorvcpuprofileprovider.so
remove /opt/pegasus/lib/libcorvcomputersystemprovider.so"
pegasus_is_stopped="OpenPegasus does not run, and only the server can take registrations back; start cimserver, then run this again"

compile() { "$tree/opt/pegasus/bin/cimmof" "-n$1" "$tree$share/$2"; }
compile_by_hand() {
  local unit
  ln -s /usr/lib/x86_64-linux-gnu/cmpi/lib{corvcpuprofile,corvcomputersystem}provider.so "$tree/opt/pegasus/lib"
  for unit in computersystem cpu; do
    compile root/cimv2 "schema/corvane-$unit.mof"
    compile root/PG_InterOp "pegasus/corvane-$unit.mof"
  done
}
agent_serves_the_system() {
  cat >"$tree/agent.mof" <<<'instance of PG_ProviderCapabilities {
   ProviderModuleName = "AgentModule";
   CapabilityID = "1";
   ClassName = "HALDA_ComputerSystem";
};'
  "$tree/opt/pegasus/bin/cimmof" -nroot/PG_InterOp "$tree/agent.mof"
}

# text_of CLASS...: of which text they were compiled.
text_of() { for class; do cat "$tree$classes/$class".*; done; }

pegasus_installs_once_and_removes_all() {
  pegasus
  local before
  before=$(state)
  expect_result 3 "pegasus: not registered" status
  expect_result 0 "$pegasus_links
$pegasus_system
$pegasus_cpu
$pegasus_registered" install
  expect "compiled" "cimmof -uc -aV -nroot/PG_InterOp $share/pegasus/corvane-computersystem.mof
cimmof -uc -aV -nroot/cimv2 $share/schema/corvane-computersystem.mof
cimmof -uc -aV -nroot/PG_InterOp $share/pegasus/corvane-cpu.mof
cimmof -uc -aV -nroot/cimv2 $share/schema/corvane-cpu.mof" "$(calls | grep -v 'cimprovider -l')"
  expect_result 0 "$pegasus_registered" install
  expect "no second compilation" "" "$(calls | grep -v 'cimprovider -l')"
  expect_result 0 "$pegasus_removals
pegasus: not registered" remove
  expect "everything taken back" "$before" "$(state)"
  expect_result 0 "pegasus: not registered; nothing to remove" remove
}

pegasus_as_it_is_packaged_is_registered() {
  packaged_pegasus
  local before
  before=$(state)
  expect_result 0 "${pegasus_links//\/opt\/pegasus\/lib\//\/usr\/lib\/Pegasus\/providers\/}
$pegasus_system
$pegasus_cpu
$pegasus_registered" install
  register remove >/dev/null
  expect "everything taken back" "$before" "$(state)"
}

pegasus_homes_are_registered_separately() {
  pegasus
  cp -r "$tree/opt/pegasus" "$tree/opt/second"
  register install >/dev/null
  PEGASUS_HOME=/opt/second expect_result 3 "pegasus: not registered" status
  PEGASUS_HOME=/opt/second expect_result 0 "${pegasus_links//pegasus/second}
$pegasus_system
$pegasus_cpu
$pegasus_registered" install
  register remove >/dev/null
  PEGASUS_HOME=/opt/second expect_result 0 "$pegasus_registered" status
}

pegasus_server_of_another_home_is_not_talked_to() {
  pegasus
  printf '%s\n' OperatingSystemModule OtherModule >"$tree/other-server"
  expect_refusal "the OpenPegasus that runs does not serve $repository; stop it, start this one's cimserver, then run this again" install
}

pegasus_home_without_a_broker_is_refused() {
  pegasus
  PEGASUS_HOME=/opt/nothing expect_refusal "PEGASUS_HOME names /opt/nothing, which has neither a repository nor bin/cimserver; correct or unset it" install
}

pegasus_that_is_stopped_is_compiled_into_but_not_taken_back() {
  pegasus
  : >"$tree/stopped"
  register install >/dev/null
  expect "compiled" "cimmofl -uc -aV -R/opt/pegasus -Nrepository -nroot/PG_InterOp $share/pegasus/corvane-computersystem.mof" \
    "$(calls | grep cimmofl | head -n 1)"
  expect_result 0 "$pegasus_registered" status
  expect_result 0 "$pegasus_registered" install
  expect_refusal "$pegasus_is_stopped" remove
  sed -i 's/Version = .*/Version = "7.7.7";/' "$tree$share/pegasus/corvane-cpu.mof"
  expect_refusal "$pegasus_is_stopped" install
  # One of its two modules is gone already.
  sed -i 's/^0\(.*CorvaneCPUModule\)/1\1/' "$tree$repository/root#PG_InterOp/instances/PG_ProviderModule.idx"
  expect_refusal "$pegasus_is_stopped" install
}

pegasus_leaves_the_computer_system_to_its_agent() {
  pegasus
  : >"$tree$classes/HALDA_ComputerSystem.CIM_ComputerSystem"
  local before
  before=$(state)
  expect_result 0 "leave HALDA_ComputerSystem to its agent ($repository)
$pegasus_links
$pegasus_cpu
$pegasus_without" install
  expect_result 0 "$pegasus_without" status
  register remove >/dev/null
  expect "the agent's class stays" "$before" "$(state)"
}

pegasus_leaves_the_computer_system_to_a_later_agent() {
  pegasus
  register install >/dev/null
  agent_serves_the_system
  local left
  left="leave HALDA_ComputerSystem to its agent (module AgentModule)
$(grep -v 'class HALDA_ComputerSystem' <<<"$pegasus_removals")"
  expect_result 0 "leave HALDA_ComputerSystem to its agent (module AgentModule)
$(tail -n +2 <<<"$left" | sed 's/^/would /')" remove --dry-run
  expect_result 0 "$left
pegasus: not registered" remove
  expect "the class stays" 1 "$(find "$tree$repository" -name 'HALDA_*' | wc -l)"
}

pegasus_with_another_agent_for_our_classes_is_refused() {
  pegasus
  cat >"$tree/agent.mof" <<<'instance of PG_ProviderCapabilities {
   ProviderModuleName = "OtherModule";
   CapabilityID = "1";
   ClassName = "halda_CPUMemory";
};'
  "$tree/opt/pegasus/bin/cimmof" -nroot/PG_InterOp "$tree/agent.mof"
  calls >/dev/null
  expect_refusal "HALDA_CPUMemory belongs to another agent: module OtherModule names it; remove that agent's registration first" install
  sed -i 's/^0\(.*OtherModule\)/1\1/' "$tree$repository/root#PG_InterOp/instances/PG_ProviderCapabilities.idx"
  expect "removed agent" "$pegasus_registered" "$(register install | tail -n 1)"
}

pegasus_interrupted_install_is_completed() {
  pegasus
  : >"$tree/broken"
  expect_result 250 "$pegasus_links
$(head -n 1 <<<"$pegasus_system")
Parsing error: $share/pegasus/corvane-computersystem.mof:1: syntax error before '{'" install
  expect_result 1 "pegasus: incomplete, module CorvaneComputerSystemModule is not registered; run corvcpu-register install" status
  rm "$tree/broken"
  expect_result 0 "$pegasus_system
$pegasus_cpu
$pegasus_registered" install
}

pegasus_upgrade_and_downgrade_update_the_classes() {
  pegasus
  register install >/dev/null
  local older
  older=$(text_of HALDA_CPUMemory HALDA_ComputerSystem)
  cp "$tree$share/schema/corvane-cpu.mof" "$scratch/older.mof"
  echo '// newer' >>"$tree$share/schema/corvane-cpu.mof"
  expect_result 1 "pegasus: incomplete, another version of $share/schema/corvane-cpu.mof is compiled; run corvcpu-register install" status
  expect_result 0 "compile $share/schema/corvane-cpu.mof into root/cimv2
$pegasus_registered" update
  expect "class" "// newer" "$(text_of HALDA_CPUMemory | tail -n 1)"
  expect_result 0 "$pegasus_registered" install
  cp "$scratch/older.mof" "$tree$share/schema/corvane-cpu.mof"
  register update >/dev/null
  expect "classes" "$older" "$(text_of HALDA_CPUMemory HALDA_ComputerSystem)"
}

pegasus_upgrade_replaces_the_modules() {
  pegasus
  register install >/dev/null
  sed -i 's/ Version = .*/ Version = "7.7.7";/' "$tree$share/pegasus/corvane-cpu.mof"
  expect_result 0 "remove module CorvaneCPUModule
remove module CorvaneCPUCacheModule
compile $share/pegasus/corvane-cpu.mof into root/PG_InterOp
$pegasus_registered" update
  expect "modules of that version" 2 "$(grep -c '^<VALUE>7.7.7</VALUE>' "$tree$repository/root#PG_InterOp/instances/PG_ProviderModule.instances")"
}

pegasus_module_removed_by_hand_is_seen() {
  pegasus
  register install >/dev/null
  "$tree/opt/pegasus/bin/cimprovider" -r -m CorvaneCPUModule
  expect_result 1 "pegasus: incomplete, module CorvaneCPUModule is not registered; run corvcpu-register install" status
  expect_result 0 "remove module CorvaneCPUCacheModule
compile $share/pegasus/corvane-cpu.mof into root/PG_InterOp
$pegasus_registered" install
}

pegasus_registration_removed_by_hand_is_seen() {
  pegasus
  register install >/dev/null
  for module in CorvaneComputerSystemModule CorvaneCPUModule CorvaneCPUCacheModule; do
    "$tree/opt/pegasus/bin/cimprovider" -r -m "$module"
  done
  rm "$tree$classes"/HALDA_*
  unlink "$tree/opt/pegasus/lib/libcorvcpuprofileprovider.so"
  unlink "$tree/opt/pegasus/lib/libcorvcomputersystemprovider.so"
  expect_result 3 "pegasus: not registered" status
}

pegasus_registration_by_hand_is_removed() {
  pegasus
  local before
  before=$(state)
  compile_by_hand
  expect_result 0 "$pegasus_registered" status
  expect_result 0 "$pegasus_removals
pegasus: not registered" remove
  expect "everything removed" "$before" "$(state)"
}

pegasus_classes_compiled_by_hand_are_adopted() {
  pegasus
  compile root/cimv2 schema/corvane-computersystem.mof
  expect_result 0 "$pegasus_links
$pegasus_system
$pegasus_cpu
$pegasus_registered" install
}

pegasus_registration_by_hand_is_adopted() {
  pegasus
  compile_by_hand
  expect_result 0 "remove module CorvaneComputerSystemModule
$pegasus_system
remove module CorvaneCPUModule
remove module CorvaneCPUCacheModule
$pegasus_cpu
$pegasus_registered" install
}

pegasus_without_the_library_is_incomplete() {
  pegasus
  register install >/dev/null
  rm "$tree/opt/pegasus/lib/libcorvcpuprofileprovider.so"
  expect_result 1 "pegasus: incomplete, /opt/pegasus/lib has no libcorvcpuprofileprovider.so; run corvcpu-register install" status
}

pegasus_without_the_dmtf_schema_is_refused() {
  pegasus
  rm "$tree$classes/CIM_ProcessorCore.CIM_EnabledLogicalElement"
  expect_refusal "the DMTF schema in $repository/root#cimv2 has no CIM_ProcessorCore; compile CIM schema 2.22 or later into root/cimv2, then run this again" install
}

pegasus_by_half_is_refused() {
  pegasus
  rm "$tree/opt/pegasus/bin/cimmofl"
  expect_refusal "OpenPegasus is there by half: no cimmofl in /opt/pegasus/bin; install the broker completely first" install
  rm "$tree/opt/pegasus/bin/cimserver"
  expect_refusal "OpenPegasus is there by half: no cimserver in /opt/pegasus/bin; install the broker completely first" install
}

pegasus_dry_run_changes_nothing_and_prints_the_steps() {
  pegasus
  local before
  before=$(state)
  expect_result 0 "$(printf '%s\n' "$pegasus_links" "$pegasus_system" "$pegasus_cpu" | sed 's/^/would /')" install --dry-run
  expect "nothing changed" "$before" "$(state)"
  register install >/dev/null
  before=$(state)
  expect_result 0 "$(sed 's/^/would /' <<<"$pegasus_removals")" remove --dry-run
  expect "nothing removed" "$before" "$(state)"
}
