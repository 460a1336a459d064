# What the brokers' tools of the tests share. They stand for those of SFCB 1.3.18 and OpenPegasus 2.14 and do what these
# were seen to do. The tree is named by $tree.
# shellcheck shell=sh disable=SC2034,SC2154

record_call() { echo "${0##*/} $*" | sed "s|$tree/|/|g" >>"$tree/calls"; }

# The files of OpenPegasus: below the directory that it was built into, or as it is packaged.
state=${0%/bin/*}
[ -d "$state/repository" ] || state=$tree/var/lib/Pegasus
classes=$state/repository/root#cimv2/classes
instances=$state/repository/root#PG_InterOp/instances

need_server() {
  [ -e "$tree/stopped" ] || return 0
  echo "Pegasus Exception: Cannot connect to local CIM server. Connection failed." >&2
  exit 1
}
