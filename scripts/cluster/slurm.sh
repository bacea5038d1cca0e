# shellcheck shell=bash
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
#
# A Slurm of our own: start_slurm FOLDER NODE ... and stop_slurm. All nodes are this machine, on ports of
# their own; settings, keys, logs and sockets are in FOLDER, and a Slurm that the machine has is left alone.
# FOLDER is an absolute path without blanks.

slurm='' slurm_daemons=()
slurm_patience=20 # seconds for what is asked to end

# daemon NAME COMMAND ...: COMMAND stays in its process, which is known so; Ctrl-C is for others.
daemon() {
  local log=$slurm/$1.out
  shift
  setsid "$@" >"$log" 2>&1 </dev/null 9>&- &
  slurm_daemons+=($!)
}

# until_true SECONDS COMMAND ...
until_true() {
  local end=$((SECONDS + $1))
  shift
  until "$@"; do
    ((SECONDS < end)) || return 1
    sleep 0.05
  done
}

free_ports() { # free_ports COUNT
  python3 -c 'import socket, sys
sockets = [socket.create_server(("127.0.0.1", 0)) for _ in range(int(sys.argv[1]))]
print(*(one.getsockname()[1] for one in sockets))' "$1"
}

start_munge() {
  local folder=$slurm/munge as=()
  mkdir -m 755 "$folder"
  head -c 128 /dev/urandom >"$folder/key"
  chmod 400 "$folder/key"
  # Its own user where there is one that gets here.
  if [ "$(id -u)" = 0 ] && setpriv --reuid=munge --regid=munge --clear-groups test -x "$folder"; then
    as=(setpriv --reuid=munge --regid=munge --clear-groups)
    chown -R munge:munge "$folder"
  fi
  daemon munged "${as[@]}" /usr/sbin/munged --foreground --force --socket="$folder/socket" \
    --key-file="$folder/key" --log-file="$folder/log" --pid-file="$folder/pid" --seed-file="$folder/seed"
  until_true 20 test -S "$folder/socket"
}

are_idle() { [ "$(sinfo --noheader --states=idle --format=%D 2>/dev/null)" = "$1" ]; }

start_slurm() {
  # Of this name first: by it all that belongs to this Slurm is found at the end.
  export SLURM_CONF=$1/slurm.conf
  slurm=$1
  shift
  local ports host node
  read -ra ports < <(free_ports $(($# + 1)))
  host=$(hostname -s)
  mkdir -p "$slurm/state"
  {
    cat <<CONF
ClusterName=farm
SlurmctldHost=$host(127.0.0.1)
SlurmctldPort=${ports[0]}
SlurmUser=$(id -un)
SlurmdUser=$(id -un)
AuthType=auth/munge
# A task that is put back starts again when its first credential has expired.
AuthInfo=socket=$slurm/munge/socket,cred_expire=5
StateSaveLocation=$slurm/state
SlurmdSpoolDir=$slurm/spool-%n
SlurmctldPidFile=$slurm/slurmctld.pid
SlurmdPidFile=$slurm/slurmd-%n.pid
SlurmctldLogFile=$slurm/slurmctld.log
SlurmdLogFile=$slurm/slurmd-%n.log
ProctrackType=proctrack/linuxproc
TaskPlugin=task/none
SelectType=select/cons_tres
SelectTypeParameters=CR_CPU
MpiDefault=none
MailProg=/bin/true
ReturnToService=2
PartitionName=all Nodes=ALL Default=YES State=UP
CONF
    for node in "$@"; do
      ports=("${ports[@]:1}")
      printf 'NodeName=%s NodeHostname=%s NodeAddr=127.0.0.1 Port=%s CPUs=1\n' "$node" "$host" "${ports[0]}"
    done
  } >"$SLURM_CONF"

  start_munge || { tail "$slurm/munged.out" >&2; return 1; }
  daemon slurmctld /usr/sbin/slurmctld -D
  for node in "$@"; do
    mkdir -p "$slurm/spool-$node"
    daemon "slurmd-$node" /usr/sbin/slurmd -D -N "$node"
  done
  until_true 60 are_idle $# \
    || { tail -n 5 "$slurm"/*.out >&2; return 1; }
}

# Processes that belong to this Slurm by their environment: tasks, and what watches over them.
slurm_processes() {
  env -u SLURM_CONF grep -lsxzF "SLURM_CONF=$SLURM_CONF" /proc/[0-9]*/environ | cut -d/ -f3
}

has_no_job() { [ -z "$(timeout 5 squeue --noheader 2>/dev/null)" ]; }

have_ended() { ! kill -0 "$@" 2>/dev/null; }

# end_daemons PROCESS ...: asks them to end, and waits a while.
end_daemons() {
  (($#)) || return 0
  kill "$@" 2>/dev/null
  until_true "$slurm_patience" have_ended "$@"
}

# Ends everything that start_slurm and the jobs started, also when it was interrupted before a daemon was
# noted. What does not end when it is asked is killed.
stop_slurm() {
  local left
  [ -n "$slurm" ] || return 0
  timeout 10 scancel --quiet --full --user="$(id -un)" 2>/dev/null
  until_true 10 has_no_job
  # The key's keeper goes last, since the others talk by it.
  end_daemons "${slurm_daemons[@]:1}"
  end_daemons "${slurm_daemons[@]:0:1}"
  mapfile -t left < <(slurm_processes)
  ((${#left[@]} == 0)) || kill -KILL "${left[@]}" 2>/dev/null
  slurm='' slurm_daemons=()
}
