"""What running a program costs."""

import dataclasses
import os
import statistics
import subprocess


class Failure(Exception):
    """A program failed or did not do what it should have."""


@dataclasses.dataclass(frozen=True)
class Cost:
    cpu: float  # seconds, user and system
    wall: float  # seconds
    peak: float  # MiB


def read(result):
    """What the program `measure` wrote into the file `result`."""
    with open(result, encoding="ascii") as file:
        user, system, wall, peak = map(float, file.read().split())
    return Cost(user + system, wall, peak / 1024)


def run(measure, command, environment, directory):
    """The cost of the command and what it printed."""
    result = os.path.join(directory, "cost")
    done = subprocess.run([measure, result, *command], env={**os.environ, **environment},
                          stdout=subprocess.PIPE, stderr=subprocess.PIPE, text=True,
                          check=False)
    if done.returncode != 0:
        raise Failure(f"{' '.join(command)} ended with status {done.returncode}\n"
                      f"{done.stdout}{done.stderr}")
    return read(result), done.stdout


def middle(costs):
    """The medians of CPU and time, and the largest peak."""
    return Cost(statistics.median(cost.cpu for cost in costs),
                statistics.median(cost.wall for cost in costs),
                max(cost.peak for cost in costs))


def ratio(costs, floors):
    """The median of the ratios of CPU turn by turn, which a busy moment of the machine changes less
    than it changes the figures."""
    return statistics.median(cost.cpu / max(floor.cpu, 1e-6)
                             for cost, floor in zip(costs, floors, strict=True))
