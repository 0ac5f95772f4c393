"""This machine's own inventory: the object manager that the generator starts for itself, and other
programs that list what a machine has."""

import contextlib
import os
import shutil
import statistics
import subprocess
import time

import cost
import table

START_ROUNDS = 30
START_GOAL_MILLISECONDS = 30
SERVED_TIMES = 40
DECLARED_INSTANCES = 5000
OTHERS_SHARE = 0.25


def show_start(programs):
    """Whatever embedded-start tells, and whether its median keeps the goal."""
    done = subprocess.run([os.path.join(programs, "embedded-start"),
                           os.path.join(programs, "cimomd"), str(START_ROUNDS)],
                          stdout=subprocess.PIPE, text=True, check=True)
    median = float(done.stdout.splitlines()[0].split("median")[1].split()[0])
    print(f"\nFrom the start of cimomd to its first answer, {START_ROUNDS} turns\n\n{done.stdout}"
          f"goal of the median: {table.judged(median, START_GOAL_MILLISECONDS)}")


@contextlib.contextmanager
def object_manager(programs, directory, mof):
    """Runs cimomd; gives its socket and its number."""
    socket = os.path.join(directory, "socket")
    with open(os.path.join(directory, "manager-log"), "w", encoding="utf-8") as log:
        manager = subprocess.Popen(
            [os.path.join(programs, "cimomd"), "--socket", socket, "--mof-dir", mof], stderr=log)
    try:
        end = time.monotonic() + 20
        while not os.path.exists(socket):
            if time.monotonic() > end or manager.poll() is not None:
                raise cost.Failure("cimomd does not listen")
            time.sleep(0.01)
        yield socket, manager.pid
    finally:
        manager.terminate()
        manager.wait()
        with contextlib.suppress(FileNotFoundError):
            os.unlink(socket)


def own_cpu(process):
    """Seconds, user and system, without those of programs that it asked."""
    with open(f"/proc/{process}/stat", encoding="utf-8", errors="replace") as file:
        fields = file.read().rpartition(")")[2].split()
    return (int(fields[11]) + int(fields[12])) / os.sysconf("SC_CLK_TCK")


def serve(programs, directory, mof, class_name, times):
    """CPU of cimomd and of its client, and the instances of one enumeration."""
    with object_manager(programs, directory, mof) as (socket, manager):
        client, printed = cost.run(
            os.path.join(programs, "measure"),
            [os.path.join(programs, "fetch"), "-n", str(times), class_name],
            {"CIM_LOCAL_SOCKET": socket}, directory)
        taken = own_cpu(manager)
    return taken, client.cpu, int(printed.split()[0]) // times


def serving_rows(programs, directory, mof, class_name, turns):
    """What an instance costs cimomd and its client: many enumerations less one, so that neither
    start counts."""
    servers, clients = [], []
    for _ in range(turns):
        once = serve(programs, directory, mof, class_name, 1)
        often = serve(programs, directory, mof, class_name, 1 + SERVED_TIMES)
        instances = often[2] * SERVED_TIMES
        if instances == 0:
            raise cost.Failure(f"cimomd has no instance of {class_name}")
        servers.append((often[0] - once[0]) / instances * 1e6)
        clients.append((often[1] - once[1]) / instances * 1e6)
    server, client = statistics.median(servers), statistics.median(clients)
    return [[f"cimomd, {class_name}", f"{server:.1f}", f"{server / client:.2f}",
             table.judged(server / client, 1)],
            [f"fetch, {class_name}", f"{client:.1f}", "1.00", ""]]


def show_serving(programs, directory, turns):
    """Instances that cimomd finds on the machine (packages), and such as an administrator declares."""
    mof = os.path.join(directory, "mof")
    os.mkdir(mof)
    with open(os.path.join(mof, "synthetic.mof"), "w", encoding="utf-8") as file:
        subprocess.run([os.path.join(programs, "synthetic-mof"), str(DECLARED_INSTANCES)],
                       stdout=file, check=True)
    rows = []
    for class_name in ("Velmira_SoftwareIdentity", "Bench_Device000"):
        rows += serving_rows(programs, directory, mof, class_name, turns)
    table.show(f"CPU per instance served ({turns} turns)",
               ["", "µs", "over fetch", "goal"], rows)


def show_whole_run(programs, scripts, directory, turns):
    """All shipped scripts with the object manager that the generator starts, beside others."""
    output = os.path.join(directory, "output")
    configuration = os.path.join(directory, "velm.properties")
    with open(configuration, "w", encoding="utf-8") as file:
        file.write(f"sennet.directory={scripts}\nsennet.resources={scripts}/sennet.properties\n")
    own = {"VELM_CONFIG": configuration, "CIM_COMMAND": os.path.join(programs, "cimomd")}
    commands = {
        "sennet /SMS with cimomd": ([os.path.join(programs, "sennet"), "/SMS", output], own),
        "fusioninventory-inventory": (["fusioninventory-inventory"], {}),
        "lshw -xml": (["lshw", "-xml"], {}),
    }
    costs = {name: [] for name in commands}
    for _ in range(turns):
        for name, (command, environment) in commands.items():
            taken, printed = cost.run(os.path.join(programs, "measure"), command, environment,
                                      directory)
            costs[name].append(taken)
            complete = "Processing operatingsystem..." if environment else "</"
            if complete not in printed:
                raise cost.Failure(f"{name} has no inventory")
        shutil.rmtree(output)
    other = costs["fusioninventory-inventory"]
    rows = []
    for name, taken in costs.items():
        typical, share = cost.middle(taken), cost.ratio(taken, other)
        goal = OTHERS_SHARE if name.startswith("sennet") else None
        rows.append([name, f"{typical.cpu:.3f}", f"{typical.wall:.3f}", f"{typical.peak:.1f}",
                     f"{share:.2f}", table.judged(share, goal)])
    table.show(f"This machine's inventory, CPU of all processes ({turns} turns)",
               ["", "CPU s", "wall s", "peak MiB", "CPU / fusioninventory", "goal"], rows)


def compare(programs, scripts, directory, turns):
    show_start(programs)
    show_serving(programs, directory, turns)
    show_whole_run(programs, scripts, directory, turns)
