"""Measures the generator on synthetic inventories, beside what reading these must cost.

Every figure comes from a process of its own. The tasks run in turns, so that a busy moment of the
machine strikes all of them; shown are the medians of the turns."""

import argparse
import os
import shutil
import signal
import subprocess
import sys
import tempfile

import cost
import inventory
import machine
import table

SCRIPTS = os.path.join(os.path.dirname(os.path.abspath(__file__)), "../../inventory")
LARGE = 50000
GOALS = {"fetch": 0.4, "sennet /SMS": 0.7, "sennet /LD": 0.7, "sennet /CA": 1.8, "sennet /QVE": 1.0}
PEAK_GOALS = {"sennet /SMS": 120}
SMALL_SCRIPTS_GOAL = 2
GROWTH_GOAL = 10.5


def parse_arguments():
    parser = argparse.ArgumentParser(prog="bench/compare", description=__doc__)
    parser.add_argument("--programs", help=argparse.SUPPRESS)
    parser.add_argument("--quick", action="store_true",
                        help="small inventories, once: only whether all of them arrives")
    parser.add_argument("--sizes", metavar="N,N...",
                        help="only inventories of one class of 20 properties with so many instances")
    parser.add_argument("--machine", action="store_true",
                        help="only this machine's own inventory, with the object manager")
    parser.add_argument("--repeat", type=int, default=5, metavar="N",
                        help="turns; large inventories have fewer (%(default)s)")
    return parser.parse_args()


def chosen_inventories(arguments):
    if arguments.quick:
        return [inventory.Inventory(1, 20, 500), inventory.Inventory(5, 20, 10),
                inventory.Inventory(1, 300, 20)]
    if arguments.machine:
        return []
    if arguments.sizes is not None:
        return [inventory.Inventory(1, 20, int(size)) for size in arguments.sizes.split(",")]
    # The one that takes longest comes last.
    return [inventory.Inventory(1, 20, LARGE), inventory.Inventory(1, 20, 5000),
            inventory.Inventory(200, 20, 10), inventory.Inventory(1, 300, 3333),
            inventory.Inventory(1, 20, 10 * LARGE)]


def turns_for(chosen, arguments):
    if arguments.quick:
        return 1
    return max(1, arguments.repeat * 2 // 5) if chosen.instances > LARGE else arguments.repeat


def goals_for(chosen):
    """Of the CPU over that of floor-parse, and of the peak, by task."""
    if chosen == inventory.Inventory(1, 20, LARGE):
        return GOALS, PEAK_GOALS
    if chosen.classes > 1:
        return {name: SMALL_SCRIPTS_GOAL for name in GOALS if name != "fetch"}, {}
    return {}, {}


def work_directory(inventories):
    """A directory in memory if the outputs leave enough of it, so that no disk is measured."""
    need = 5 * 250 * max((chosen.values() for chosen in inventories), default=0)
    memory = "/dev/shm"
    if os.path.isdir(memory) and os.access(memory, os.W_OK):
        with open("/proc/meminfo", encoding="ascii") as file:
            available = next(int(line.split()[1]) * 1024 for line in file
                             if line.startswith("MemAvailable:"))
        if min(shutil.disk_usage(memory).free, available) > need:
            return tempfile.TemporaryDirectory(dir=memory)
    return tempfile.TemporaryDirectory()


def show_costs(chosen, costs):
    ratio_goals, peak_goals = goals_for(chosen)
    rows = []
    for name, turns in costs.items():
        typical = cost.middle(turns)
        ratio = cost.ratio(turns, costs["floor-parse"])
        rows.append([name, f"{typical.cpu:.3f}", f"{typical.wall:.3f}", f"{typical.peak:.1f}",
                     table.judged(typical.peak, peak_goals.get(name)), f"{ratio:.2f}",
                     table.judged(ratio, ratio_goals.get(name))])
    turns = len(costs["fetch"])
    table.show(f"{chosen} ({turns} turn{'s' * (turns > 1)})",
               ["", "CPU s", "wall s", "peak MiB", "goal", "CPU / floor-parse", "goal"], rows)


def show_growth(results):
    small = results.get(inventory.Inventory(1, 20, LARGE))
    large = results.get(inventory.Inventory(1, 20, 10 * LARGE))
    if small is None or large is None:
        return
    rows = []
    for name in small:
        growth = cost.middle(large[name]).cpu / cost.middle(small[name]).cpu
        goal = GROWTH_GOAL if name in GOALS else None
        rows.append([name, f"{growth:.2f}", table.judged(growth, goal)])
    table.show(f"CPU of {10 * LARGE:,} over {LARGE:,} instances", ["", "ratio", "goal"], rows)


def main():
    arguments = parse_arguments()
    inventories = chosen_inventories(arguments)
    results = {}
    with work_directory(inventories) as directory:
        if not arguments.quick and arguments.sizes is None:
            machine.compare(arguments.programs, SCRIPTS, directory, arguments.repeat)
        for chosen in inventories:
            results[chosen] = inventory.compare(arguments.programs, chosen,
                                                turns_for(chosen, arguments), directory)
            if arguments.quick:
                print(f"{chosen}: complete in every output")
            else:
                show_costs(chosen, results[chosen])
    show_growth(results)


if __name__ == "__main__":
    # Leaves no server and no output behind when it is told to end.
    signal.signal(signal.SIGTERM, lambda *_: sys.exit(1))
    try:
        main()
    except (cost.Failure, OSError, subprocess.SubprocessError) as failure:
        sys.exit(f"bench/compare: {failure}")
