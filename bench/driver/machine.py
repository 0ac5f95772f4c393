"""This machine's own inventory: the object manager that the generator starts for itself, and other
programs that list what a machine has."""

import contextlib
import os
import shutil
import subprocess
import time

import cost
import table

START_ROUNDS = 30
START_GOAL_MILLISECONDS = 30
SERVED_CLASS = "Velmira_SoftwareIdentity"
SERVED_TIMES = 40
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
def object_manager(programs, directory, result):
    """Runs cimomd and gives the socket; afterwards `result` has what it cost."""
    socket = os.path.join(directory, "socket")
    with open(os.path.join(directory, "manager-log"), "w", encoding="utf-8") as log:
        manager = subprocess.Popen(
            [os.path.join(programs, "measure"), result, os.path.join(programs, "cimomd"),
             "--socket", socket], stderr=log)
    try:
        end = time.monotonic() + 20
        while not os.path.exists(socket):
            if time.monotonic() > end or manager.poll() is not None:
                raise cost.Failure("cimomd does not listen")
            time.sleep(0.01)
        yield socket
    finally:
        children = f"/proc/{manager.pid}/task/{manager.pid}/children"
        with open(children, encoding="ascii") as file:
            for child in file.read().split():
                os.kill(int(child), 15)
        manager.wait()
        with contextlib.suppress(FileNotFoundError):
            os.unlink(socket)


def serve(programs, directory, times):
    """CPU of cimomd and of its client, and the instances of one enumeration."""
    result = os.path.join(directory, "manager-cost")
    with object_manager(programs, directory, result) as socket:
        client, printed = cost.run(
            os.path.join(programs, "measure"),
            [os.path.join(programs, "fetch"), "-n", str(times), SERVED_CLASS],
            {"CIM_LOCAL_SOCKET": socket}, directory)
    return cost.read(result).cpu, client.cpu, int(printed.split()[0]) // times


def show_serving(programs, directory, turns):
    """What an instance costs cimomd and its client: many enumerations less one, so that neither
    start counts."""
    servers, clients = [], []
    for _ in range(turns):
        once = serve(programs, directory, 1)
        often = serve(programs, directory, 1 + SERVED_TIMES)
        instances = often[2] * SERVED_TIMES
        if instances == 0:
            raise cost.Failure(f"this machine has no instance of {SERVED_CLASS}")
        servers.append((often[0] - once[0]) / instances * 1e6)
        clients.append((often[1] - once[1]) / instances * 1e6)
    server, client = sorted(servers)[turns // 2], sorted(clients)[turns // 2]
    table.show(f"An instance of {SERVED_CLASS} (median of {turns})",
               ["", "CPU µs", "over fetch", "goal"],
               [["cimomd, reading the machine and serving", f"{server:.1f}",
                 f"{server / client:.2f}", table.judged(server / client, 1)],
                ["fetch", f"{client:.1f}", "1.00", ""]])


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
