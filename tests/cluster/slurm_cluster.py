"""A Slurm cluster on one machine: controller, node daemons and munge, in a network of its own.

To be used inside the namespaces that cluster_test.py makes: the cluster's address, 10.99.0.1, is on their loopback,
and what it starts ends with them.
"""

import os
import pathlib
import subprocess
import time

ADDRESS = "10.99.0.1"
HOST = "controller"
NODES = 4

# Several node daemons on one machine say what they have, whatever the machine has.
CONFIGURATION = """\
ClusterName=studies
SlurmctldHost={host}({address})
SlurmctldPort=17000
SlurmUser=root
SlurmdUser=root
AuthType=auth/munge
AuthInfo=socket={folder}/munge.socket
CryptoType=crypto/munge
MpiDefault=none
ProctrackType=proctrack/linuxproc
TaskPlugin=task/none
SelectType=select/cons_tres
SelectTypeParameters=CR_Core
SchedulerType=sched/backfill
SchedulerParameters=batch_sched_delay=0,sched_interval=1,sched_min_interval=0
JobAcctGatherType=jobacct_gather/none
AccountingStorageType=accounting_storage/none
SlurmdParameters=config_overrides
ReturnToService=2
MinJobAge=3600
KillWait=5
StateSaveLocation={folder}/state
SlurmctldPidFile={folder}/slurmctld.pid
SlurmctldLogFile={folder}/slurmctld.log
SlurmdPidFile={folder}/slurmd.%n.pid
SlurmdLogFile={folder}/slurmd.%n.log
SlurmdSpoolDir={folder}/spool.%n
NodeName=node[1-{nodes}] NodeHostname={host} NodeAddr={address} Port=[17001-{last}] CPUs=2 RealMemory=16000 State=UNKNOWN
PartitionName=all Nodes=ALL Default=YES MaxTime=INFINITE State=UP
"""


class Cluster:
    def __init__(self, folder):
        self.folder = pathlib.Path(folder)
        self.folder.mkdir(mode=0o755)
        self.processes = []

    def __enter__(self):
        subprocess.run(["ip", "address", "add", ADDRESS + "/32", "dev", "lo"], check=True)
        subprocess.run(["ip", "link", "set", "lo", "up"], check=True)
        subprocess.run(["hostname", HOST], check=True)
        hosts = self.folder / "hosts"
        hosts.write_text(f"127.0.0.1 localhost\n{ADDRESS} {HOST}\n")
        # In the namespaces' own view of the files.
        subprocess.run(["mount", "--bind", str(hosts), "/etc/hosts"], check=True)
        (self.folder / "slurm.conf").write_text(CONFIGURATION.format(
            host=HOST, address=ADDRESS, folder=self.folder, nodes=NODES, last=17000 + NODES))
        (self.folder / "state").mkdir()
        os.environ["SLURM_CONF"] = str(self.folder / "slurm.conf")
        self.start_munge()
        self.start("slurmctld", "-D", "-i")
        for node in range(1, NODES + 1):
            (self.folder / f"spool.node{node}").mkdir()
            self.start("slurmd", "-D", "-N", f"node{node}")
        self.wait_until(lambda: self.run("sinfo", "-h", "-o", "%D", "-t", "idle").strip() == str(NODES),
                        "the nodes don't come up")
        return self

    def __exit__(self, *_):
        for process in reversed(self.processes):
            process.terminate()
        for process in self.processes:
            process.wait(timeout=30)

    def start(self, *command):
        with open(self.folder / (command[0] + ".out"), "ab") as log:
            self.processes.append(subprocess.Popen(command, stdout=log, stderr=log))

    def start_munge(self):
        key = self.folder / "munge.key"
        key.write_bytes(os.urandom(1024))
        key.chmod(0o400)
        self.start("munged", "--foreground", "--force", "--num-threads=2", f"--key-file={key}",
                   f"--socket={self.folder}/munge.socket", f"--pid-file={self.folder}/munge.pid",
                   f"--seed-file={self.folder}/munge.seed", f"--log-file={self.folder}/munge.log")
        self.wait_until(lambda: (self.folder / "munge.socket").exists(), "munge doesn't come up")

    def wait_until(self, condition, complaint, seconds=300):
        end = time.monotonic() + seconds
        while not condition():
            if time.monotonic() > end:
                logs = "".join(f"== {log.name}\n{log.read_text(errors='replace')[-2000:]}\n"
                               for log in sorted(self.folder.glob("*.log")) + sorted(self.folder.glob("*.out")))
                raise RuntimeError(f"{complaint}\n{logs}")
            time.sleep(0.2)

    @staticmethod
    def run(*command):
        return subprocess.run(command, stdout=subprocess.PIPE, text=True, check=False).stdout

    def jobs_left(self):
        return [line for line in self.run("squeue", "-h", "-r", "-o", "%i %T").splitlines() if line]

    def wait_for_jobs(self):
        self.wait_until(lambda: not self.jobs_left(), "jobs don't end", 600)

    def states_of(self, job):
        """The state of each task of an array job: COMPLETED, FAILED, ..."""
        states = {}
        for line in self.run("scontrol", "-o", "show", "job", str(job)).splitlines():
            words = dict(word.split("=", 1) for word in line.split() if "=" in word)
            if "ArrayTaskId" in words:
                states[int(words["ArrayTaskId"])] = words["JobState"]
        return states
