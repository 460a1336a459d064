# corvcpu-register with SFCB. Sourced by register-test.
# shellcheck shell=bash disable=SC2001,SC2154

stage=/var/lib/sfcb/stage
mofs=$stage/mofs/root/cimv2
regs=$stage/regs

sfcb_copies="build the repository with sfcbrepos
copy $share/schema/corvane-computersystem.mof to $mofs/corvane-computersystem.mof
copy $share/sfcb/corvane-computersystem.reg to $regs/corvane-computersystem.reg
copy $share/schema/corvane-cpu.mof to $mofs/corvane-cpu.mof
copy $share/sfcb/corvane-cpu.reg to $regs/corvane-cpu.reg"
sfcb_links="link /usr/lib/sfcb/libcorvcpuprofileprovider.so to /usr/lib/x86_64-linux-gnu/cmpi/libcorvcpuprofileprovider.so
link /usr/lib/sfcb/libcorvcomputersystemprovider.so to /usr/lib/x86_64-linux-gnu/cmpi/libcorvcomputersystemprovider.so"
sfcb_removals="build the repository with sfcbrepos
remove $mofs/corvane-computersystem.mof
remove $regs/corvane-computersystem.reg
remove $mofs/corvane-cpu.mof
remove $regs/corvane-cpu.reg
remove /usr/lib/sfcb/libcorvcpuprofileprovider.so
remove /usr/lib/sfcb/libcorvcomputersystemprovider.so"
sfcb_restart="sfcb: restart sfcbd; it still uses the old registration"
sfcb_registered="sfcb: registered, with HALDA_ComputerSystem"
sfcb_failure="error in /var/lib/sfcb/registration/corvane.new/stage/mofs/indication.mof line 10 near class: syntax error
Failed compiling the MOF files.
corvcpu-register: sfcbrepos failed, see above; nothing was changed. Repair what it complains about, then run this again"

by_hand() {
  local unit
  for unit in cpu computersystem; do
    "$tree/usr/bin/sfcbstage" -n root/cimv2 -r "$tree$share/sfcb/corvane-$unit.reg" "$tree$share/schema/corvane-$unit.mof"
  done
}

build_sfcb() { DESTDIR=$tree "$tree/usr/bin/sfcbrepos" -f -s "$tree$stage" -r "$tree/var/lib/sfcb/registration"; }

sfcb_installs_once_and_removes_all() {
  sfcb
  build_sfcb
  calls >/dev/null
  local before
  before=$(state)
  expect_result 3 "sfcb: not registered" status
  expect_result 0 "$sfcb_copies
$sfcb_links
$sfcb_restart
$sfcb_registered" install
  local work=/var/lib/sfcb/registration/corvane.new
  expect "calls" "sfcbrepos -f -s $work/stage -r $work" "$(calls)"
  cmp "$source/schema/corvane-cpu.mof" "$tree$mofs/corvane-cpu.mof" || failures=$((failures + 1))
  expect "schema is built" 1 "$(grep -c 'class HALDA_CPUProcessor ' "$tree/var/lib/sfcb/registration/repository/root/cimv2/classSchemas")"

  local installed
  installed=$(state)
  expect_result 0 "$sfcb_registered" install
  expect "no second build" "" "$(calls)"
  expect "no second change" "$installed" "$(state)"

  expect_result 0 "$sfcb_removals
$sfcb_restart
sfcb: not registered" remove
  expect "calls" "sfcbrepos -f -s $work/stage -r $work" "$(calls)"
  expect "everything taken back" "$before" "$(state)"
  expect_result 0 "sfcb: not registered; nothing to remove" remove
  expect "no call without work" "" "$(calls)"
}

sfcb_dry_run_changes_nothing_and_prints_the_steps() {
  sfcb
  local before
  before=$(state)
  expect_result 0 "$(printf '%s\n' "$sfcb_copies" "$sfcb_links" | sed 's/^/would /')" install --dry-run
  expect "nothing changed" "$before" "$(state)"
  register install >/dev/null
  before=$(state)
  calls >/dev/null
  expect_result 0 "$(sed 's/^/would /' <<<"$sfcb_removals")" remove --dry-run
  expect "nothing removed" "$before" "$(state)"
  expect "nothing run" "" "$(calls)"
}

sfcb_of_32_bits_gets_the_32_bit_library() {
  sfcb 1
  register install >/dev/null
  expect "link" /usr/lib/i386-linux-gnu/cmpi/libcorvcpuprofileprovider.so \
    "$(readlink "$tree/usr/lib/sfcb/libcorvcpuprofileprovider.so")"
}

sfcb_of_64_bits_refuses_32_bit_libraries() {
  sfcb
  rm -r "$tree/usr/lib/x86_64-linux-gnu"
  expect_refusal "no 64-bit libcorvcpuprofileprovider.so below /usr/lib*; install the 64-bit provider package: /usr/sbin/sfcbd can load no other" install
}

sfcb_that_looks_into_our_directory_needs_no_link() {
  sfcb
  echo 'providerDirs: /usr/lib/sfcb /usr/lib/x86_64-linux-gnu/cmpi' >"$tree/etc/sfcb/sfcb.cfg"
  expect_result 0 "$sfcb_copies
$sfcb_restart
$sfcb_registered" install
}

sfcb_without_its_tool_is_refused() {
  sfcb
  rm "$tree/usr/bin/sfcbrepos"
  expect_refusal "SFCB is there by half: no sfcbrepos in /usr/bin; install the broker completely first" install
}

sfcb_without_staging_is_refused() {
  sfcb
  rm -r "$tree$stage"
  expect_refusal "SFCB is there by half: $stage is missing; install the broker completely first" install
}

sfcb_without_the_dmtf_schema_is_refused() {
  sfcb
  rm "$tree/usr/share/sfcb/CIM/CIM_Schema.mof"
  expect_refusal "SFCB has no DMTF schema: /usr/share/sfcb/CIM/CIM_Schema.mof is missing; install it, then run this again" install
}

sfcb_with_another_agent_for_our_classes_is_refused() {
  sfcb
  printf '[halda_cpuprocessor]\n   provider: other\n' >"$tree$regs/other.reg"
  expect_refusal "HALDA_CPUProcessor belongs to another agent: $regs/other.reg names it; remove that agent's registration first" install
}

sfcb_foreign_files_are_not_overwritten() {
  sfcb
  echo foreign >"$tree$regs/corvane-cpu.reg"
  expect_refusal "$regs/corvane-cpu.reg exists and is not of this product; move it away" install
  rm "$tree$regs/corvane-cpu.reg"
  echo foreign >"$tree/usr/lib/sfcb/libcorvcpuprofileprovider.so"
  expect_refusal "/usr/lib/sfcb/libcorvcpuprofileprovider.so exists and was not put there by this program; move it away" install
}

sfcb_leaves_the_computer_system_to_its_agent() {
  sfcb
  printf '[HALDA_ComputerSystem]\n   provider: agent\n' >"$tree$regs/agent.reg"
  echo 'class HALDA_ComputerSystem : CIM_ComputerSystem {};' >"$tree$mofs/agent.mof"
  build_sfcb
  local before without="sfcb: registered, without HALDA_ComputerSystem, which is left to its agent"
  before=$(state)
  expect_result 0 "leave HALDA_ComputerSystem to its agent ($regs/agent.reg)
$(grep -v 'copy.*computersystem' <<<"$sfcb_copies")
$sfcb_links
$sfcb_restart
$without" install
  expect_result 0 "leave HALDA_ComputerSystem to its agent ($regs/agent.reg)
$without" install
  register remove >/dev/null
  expect "the agent's files stay" "$before" "$(state)"
}

sfcb_leaves_the_computer_system_to_an_agent_that_staged_nothing() {
  sfcb
  printf '[HALDA_ComputerSystem]\n   location: agent\n' >>"$tree/var/lib/sfcb/registration/providerRegister"
  expect "leave" "leave HALDA_ComputerSystem to its agent (/var/lib/sfcb/registration/providerRegister)" \
    "$(register install | head -n 1)"
}

sfcb_keeps_the_declaration_that_a_later_agent_needs() {
  sfcb
  register install >/dev/null
  printf '[HALDA_ComputerSystem]\n   provider: agent\n' >"$tree$regs/agent.reg"
  expect "leave" "leave HALDA_ComputerSystem to its agent ($regs/agent.reg)" "$(register remove | head -n 1)"
  expect "what is left" "$tree$mofs/corvane-computersystem.mof" "$(find "$tree/var" "$tree/usr/lib/sfcb" -name '*corv*')"
  expect_result 3 "sfcb: not registered" status
}

# sfcbrepos empties the repository before it compiles, and leaves it so if a class is wrong.
sfcb_keeps_its_repository_if_the_build_fails() {
  sfcb
  build_sfcb
  echo 'class Broken : CIM_Nothing {' >"$tree$mofs/zz_other.mof"
  local before
  before=$(state)
  calls >/dev/null
  expect_result 1 "build the repository with sfcbrepos
$sfcb_failure" install
  expect "nothing changed" "$before" "$(state | grep -v ' calls$')"
  expect_result 3 "sfcb: not registered" status
}

sfcb_stays_registered_if_the_build_without_us_fails() {
  sfcb
  register install >/dev/null
  echo 'class Broken : CIM_Nothing {' >"$tree$mofs/zz_other.mof"
  local before
  before=$(state)
  expect_result 1 "build the repository with sfcbrepos
$sfcb_failure" remove
  expect "nothing changed" "$before" "$(state)"
  expect_result 0 "$sfcb_registered" status
}

sfcb_interrupted_install_is_completed() {
  sfcb
  register install >/dev/null
  rm "$tree$regs/corvane-cpu.reg"
  expect_result 1 "sfcb: incomplete, $regs/corvane-cpu.reg is missing; run corvcpu-register install" status
  expect_result 0 "$sfcb_copies
$sfcb_restart
$sfcb_registered" install
}

sfcb_whose_repository_was_lost_is_incomplete() {
  sfcb
  register install >/dev/null
  rm "$tree/var/lib/sfcb/registration/repository/root/cimv2/classSchemas"
  expect_result 1 "sfcb: incomplete, sfcbrepos has not run; run corvcpu-register install" status
}

sfcb_without_the_library_is_incomplete() {
  sfcb
  register install >/dev/null
  rm "$tree/usr/lib/x86_64-linux-gnu/cmpi/libcorvcomputersystemprovider.so"
  expect_result 1 "sfcb: incomplete, no directory of \"providerDirs:\" has libcorvcomputersystemprovider.so; run corvcpu-register install" status
}

sfcb_upgrade_and_downgrade_of_the_package_register_again() {
  sfcb
  register install >/dev/null
  cp "$tree$share/schema/corvane-cpu.mof" "$scratch/older.mof"
  sed -i 's/A processor package/A newer processor package/' "$tree$share/schema/corvane-cpu.mof"
  expect_result 1 "sfcb: incomplete, $mofs/corvane-cpu.mof is from another version; run corvcpu-register install" status
  expect_result 0 "$sfcb_copies
$sfcb_restart
$sfcb_registered" update
  cp "$scratch/older.mof" "$tree$share/schema/corvane-cpu.mof"
  expect_result 0 "$sfcb_copies
$sfcb_restart
$sfcb_registered" update
}

sfcb_registration_by_hand_is_recognized_and_removed() {
  sfcb
  build_sfcb
  local before
  before=$(state)
  by_hand
  expect_result 1 "sfcb: incomplete, sfcbrepos has not run; run corvcpu-register install" status
  build_sfcb
  expect_result 1 "sfcb: incomplete, no directory of \"providerDirs:\" has libcorvcpuprofileprovider.so; run corvcpu-register install" status
  ln -s /usr/lib/x86_64-linux-gnu/cmpi/lib{corvcpuprofile,corvcomputersystem}provider.so "$tree/usr/lib/sfcb"
  expect_result 0 "$sfcb_registered" status
  expect_result 0 "$sfcb_registered" install
  register remove >/dev/null
  expect "everything removed" "$before" "$(state)"
}

sfcb_registration_by_hand_of_another_version_is_adopted() {
  sfcb
  by_hand
  sed -i 's/Version("[0-9.]*")/Version("0.9.0")/' "$tree$mofs"/corvane-*.mof
  expect_result 0 "$sfcb_copies
$sfcb_links
$sfcb_restart
$sfcb_registered" install
}

sfcb_removal_by_hand_is_seen() {
  sfcb
  register install >/dev/null
  rm "$tree/usr/lib/sfcb"/libcorv* "$tree$regs"/corvane-* "$tree$mofs"/corvane-*
  expect_result 1 "sfcb: incomplete, $mofs/corvane-computersystem.mof is missing; run corvcpu-register install" status
  build_sfcb
  expect_result 3 "sfcb: not registered" status
}
