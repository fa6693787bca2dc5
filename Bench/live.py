# SPDX-License-Identifier: Apache-2.0
"""What viewer and monitor cost while the simulated daemon sends a drive's messages at a rate."""

import os
import pathlib
import subprocess
import tempfile
import time

CLOCK_TICKS = os.sysconf("SC_CLK_TCK")
PROGRAMS = {"viewer": ("kelvasi", "--script", "-"), "monitor": ("kelvasictl", "monitor")}
# Where the lines of the system log go; the standard error leads to /dev/null.
LOGS = {"all lines": ({}, ("--log-stderr",)), "errors only": ({"KELVASI_LOG_LEVEL": "err"}, ())}


def processor_seconds(process):
    fields = pathlib.Path(f"/proc/{process.pid}/stat").read_text().rpartition(")")[2].split()
    return (int(fields[11]) + int(fields[12])) / CLOCK_TICKS


def resident_mib(process):
    lines = pathlib.Path(f"/proc/{process.pid}/status").read_text().splitlines()
    return int(dict(line.split(":", 1) for line in lines)["VmRSS"].split()[0]) / 1024


def watched(process, seconds, warm_up):
    """The share of one processor, and MiB resident at the end."""
    time.sleep(warm_up)
    before, begun = processor_seconds(process), time.monotonic()
    time.sleep(seconds)
    if process.poll() is not None:
        raise SystemExit(f"compare: a live program ended with {process.returncode}")
    return (processor_seconds(process) - before) / (time.monotonic() - begun), resident_mib(process)


def cost(tools, name, log, rate, seconds, warm_up=3):
    variables, options = LOGS[log]
    with tempfile.TemporaryDirectory() as runtime:
        environment = os.environ | variables | {
            "QT_QPA_PLATFORM": "offscreen", "TELVON_RUNTIME_DIR": runtime, "XDG_RUNTIME_DIR": runtime,
            "XDG_CONFIG_HOME": runtime}
        daemon = subprocess.Popen([tools / "telvon-sim", "--technology", "Orvane_LTE", "--rate", str(rate)],
                                  env=environment, stderr=subprocess.PIPE, text=True)
        process = None
        try:
            if not any("serving" in line for line in daemon.stderr):
                raise SystemExit("compare: the simulated daemon ended")
            program, *arguments = PROGRAMS[name]
            process = subprocess.Popen([tools / program, *arguments, *options], env=environment, stdin=subprocess.PIPE,
                                       stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
            return watched(process, seconds, warm_up)
        finally:
            for each in (process, daemon):
                if each:
                    each.kill()
                    each.wait()
