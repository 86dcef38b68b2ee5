#!/usr/bin/env python3
"""ManyCapturesTest.py SOURCE ORVEX_DECODE: does what docs/many-captures.md says for several machines, with 40 captures and
two hosts, each an sshd of its own on 127.0.0.1. One host goes away half-way. Every capture must be in the result exactly
once, with the samples that one process finds in it and those of its own table."""
import csv, ctypes, os, pathlib, shutil, signal, socket, sqlite3, struct, subprocess, sys, tempfile, textwrap, time

PR_SET_CHILD_SUBREAPER = 36
SLICES = 8  # captures made of each drive
LIMIT = 100  # s
source, decoder = pathlib.Path(sys.argv[1]), pathlib.Path(sys.argv[2])
path = f"{decoder.parent}:{os.environ['PATH']}:/usr/sbin"


def descendants(root):
    children = {}
    for stat in pathlib.Path("/proc").glob("[0-9]*/stat"):
        try:
            parent = int(stat.read_text(errors="replace").rpartition(")")[2].split()[1])
        except OSError:
            continue  # has ended meanwhile
        children.setdefault(parent, []).append(int(stat.parent.name))
    found = [root]
    for process in found:
        found += children.get(process, [])
    return found[1:]


def end(processes):
    for event in (signal.SIGSTOP, signal.SIGKILL):  # none starts another while the rest is killed
        for process in processes:
            try:
                os.kill(process, event)
            except ProcessLookupError:
                pass


def end_all():
    while processes := descendants(os.getpid()):
        end(processes)
        os.waitpid(-1, 0)


class Host:
    """A machine to log in to, whose home is a folder of its own."""

    def __init__(self, folder, name):
        self.name = name
        with socket.socket() as probe:
            probe.bind(("127.0.0.1", 0))
            self.port = probe.getsockname()[1]
        (folder / name).mkdir()
        (folder / f"{name}.sshd").write_text(f"""
ListenAddress 127.0.0.1
Port {self.port}
HostKey {folder}/host
AuthorizedKeysFile {folder}/user.pub
PasswordAuthentication no
PermitRootLogin prohibit-password
StrictModes no
UsePAM no
PidFile none
SetEnv HOME={folder}/{name} PATH={path} ORVEX_RESOURCES={source}/resources
ForceCommand cd && exec "$SHELL" -c "$SSH_ORIGINAL_COMMAND"
""")
        self.process = subprocess.Popen([shutil.which("sshd", path=path), "-D", "-f", folder / f"{name}.sshd",
                                         "-E", folder / f"{name}.log"])

    def die(self):
        end([self.process.pid, *descendants(self.process.pid)])

    def client_options(self, folder):
        return f"""
Host {self.name}
    HostName 127.0.0.1
    Port {self.port}
    HostKeyAlias loopback
    UserKnownHostsFile {folder}/known
    IdentityFile {folder}/user
    IdentitiesOnly yes
    BatchMode yes
    ControlMaster auto
    ControlPath {folder}/%n.ssh
    ControlPersist yes
"""


def make_captures(folder):
    """Cuts each drive into captures of consecutive packets."""
    folder.mkdir()
    for drive in sorted((source / "captures").glob("*.pcap")):
        content = drive.read_bytes()
        packets, place = [], 24
        while place < len(content):
            length = 16 + struct.unpack_from("<I", content, place + 8)[0]
            packets.append(content[place:place + length])
            place += length
        for i in range(SLICES):
            part = packets[len(packets) * i // SLICES:len(packets) * (i + 1) // SLICES]
            (folder / f"{drive.stem}-{i}.pcap").write_bytes(content[:24] + b"".join(part))
    return sorted(f"{folder.name}/{capture.name}" for capture in folder.iterdir())


def documented_commands():
    """The first commands under the heading."""
    section = (source / "docs/many-captures.md").read_text().split("\n## Several machines\n")[1]
    commands = section[section.index("\n\n    ") + 2:].split("\n\n")[0]
    assert "--sshloginfile hosts " in commands, commands
    return textwrap.dedent(commands)


def jobs_done(log):
    """The host of each."""
    jobs = [line.split("\t") for line in log.read_text().splitlines()] if log.exists() else []
    return [job[1].rpartition("/")[2] for job in jobs if job[6] == "0"]


def decode_on(hosts, work, environment):
    (work / "hosts").write_text("".join(f"2/{host.name}\n" for host in hosts))
    commands = subprocess.Popen(["bash", "-c", documented_commands()], cwd=work, env=environment)
    deadline, before = time.monotonic() + LIMIT, []
    while commands.poll() is None:
        assert time.monotonic() < deadline, "the commands do not end"
        if not before and len(jobs_done(work / "jobs.log")) >= len(list(work.glob("drives/*.pcap"))) / 2:
            before = jobs_done(work / "jobs.log")
            hosts[1].die()
        time.sleep(0.02)
    after = jobs_done(work / "jobs.log")
    print("done by host before the loss:", *((host.name, before.count(host.name)) for host in hosts))
    print("done by host at the end:", *((host.name, after.count(host.name)) for host in hosts))
    assert commands.returncode == 0, f"the commands end with status {commands.returncode}"
    assert "two" in before, "the host that went away did nothing"


def contents(database):
    connection = sqlite3.connect(f"file:{database}?mode=ro", uri=True)
    return [connection.execute(f"SELECT * FROM {table}").fetchall()
            for table in ("captures ORDER BY id", "paths ORDER BY id", "samples ORDER BY path, capture, n")]


def check_tables(names, work, environment):
    """The database says the same as the table of each capture."""
    connection = sqlite3.connect(work / "all.sqlite")
    for name in names:
        table = subprocess.run([decoder, "--timeline", "-", name], cwd=work, env=environment, check=True,
                               stdout=subprocess.PIPE, text=True).stdout
        lines = [(*line[:4], line[4] and float(line[4]), line[5]) for line in csv.reader(table.splitlines()[1:])]
        rows = connection.execute("SELECT time, path, key, ifnull(text, ''), ifnull(number, ''), ifnull(unit, '') "
                                  "FROM timeline WHERE name = ?", [name]).fetchall()
        assert sorted(lines) == sorted(rows) and len(rows) > 50, name
        gone = connection.execute("SELECT count(*) FROM timeline WHERE name = ? AND text IS NULL", [name])
        assert gone.fetchone()[0] == table.count(",,,\n"), name


def check(folder):
    for key in ("host", "user"):
        subprocess.run(["ssh-keygen", "-q", "-t", "ed25519", "-N", "", "-f", folder / key], check=True)
    (folder / "known").write_text("loopback " + (folder / "host.pub").read_text())
    hosts = [Host(folder, "one"), Host(folder, "two")]
    (folder / "ssh_config").write_text("".join(host.client_options(folder) for host in hosts))
    work = folder / "work"
    work.mkdir()
    names = make_captures(work / "drives")
    environment = dict(os.environ, HOME=str(work), PATH=path, PARALLEL_SSH=f"ssh -F {folder}/ssh_config",
                       ORVEX_RESOURCES=f"{source}/resources")
    decode_on(hosts, work, environment)
    captures, paths, samples = contents(work / "all.sqlite")
    assert sorted(row[1] for row in captures) == names and len(names) == 40, set(names) - {row[1] for row in captures}
    subprocess.run([decoder, "--timeline", "one.sqlite", *names], cwd=work, env=environment, check=True)
    assert [captures, paths, samples] == contents(work / "one.sqlite"), "not what one process finds"
    assert len(samples) > 1000
    check_tables(names[::SLICES], work, environment)


def main():
    ctypes.CDLL(None).prctl(PR_SET_CHILD_SUBREAPER, 1)  # what outlives its parent becomes a child of this process
    signal.signal(signal.SIGTERM, lambda *_: sys.exit("ended"))
    made = os.geteuid() == 0 and not os.path.isdir("/run/sshd")  # the service makes it when it starts
    if made:
        os.mkdir("/run/sshd", 0o755)
    with tempfile.TemporaryDirectory(ignore_cleanup_errors=True) as folder:
        try:
            check(pathlib.Path(folder))
        except AssertionError:
            for log in pathlib.Path(folder).glob("*.log"):
                print(f"== {log.name}", log.read_text()[-2000:], sep="\n", file=sys.stderr)
            raise
        finally:
            end_all()
            if made:
                os.rmdir("/run/sshd")


main()
