"""Holds the figures of `zelctl analyse` against numpy and scipy.

    analysis_check.py ZELCTL

Made traces (Gaussian filters, two tones, flat noise, pairs, zero span) are written as saved views;
what zelctl prints about them must be what an independent computation finds. Ends with 77 where numpy
or scipy is not installed.
"""

import json
import math
import subprocess
import sys
import tempfile
from pathlib import Path

SKIPPED = 77
CLOSE = 1e-6

try:
    import numpy as np
    from scipy.integrate import quad
    from scipy.signal import find_peaks
except ImportError as missing:
    print(f"skipped: {missing.name} is not installed")
    sys.exit(SKIPPED)

POINTS = 301
START, STEP, RBW = 900e6, 100e3, 1000e3
X = START + STEP * np.arange(POINTS)


def header(zero_span=False):
    span = "ZERO SPAN" if zero_span else f"{STEP * (POINTS - 1):.0f}"
    return (f"Trace Name;Analyzer\r\nSpan;{span}\r\nSweeptime;0.6\r\n"
            f"Resolution Bandwidth;{RBW:.0f}\r\nReference Unit;dBm\r\n\r\n")


def saved(levels, zero_span=False):
    rows = (f"{'.000' if zero_span else f'{x:.3f}'};{level!r}; \r\n"
            for x, level in zip(X, map(float, levels)))
    return header(zero_span) + "".join(rows)


def saved_pairs(low, high):
    """The highest level of a point stands in the row after its own; that of the last is lost."""
    shifted = np.concatenate([[low[-1]], high[:-1]])
    return header() + "".join(f"{x:.3f};{float(a)!r};{float(b)!r}\r\n"
                              for x, a, b in zip(X, low, shifted))


def gaussian(center, peak):
    """3 dB down half a resolution bandwidth away."""
    return peak - 10 * math.log10(2) * ((X - center) / (RBW / 2)) ** 2


def added(*traces):
    return 10 * np.log10(sum(10 ** (np.asarray(trace) / 10) for trace in traces))


class Check:
    def __init__(self, zelctl):
        self.zelctl = zelctl
        self.done = 0
        self.failed = []

    def ask(self, text, *options, status=0):
        with tempfile.TemporaryDirectory() as folder:
            view = Path(folder, "view.csv")
            view.write_text(text, newline="")
            run = subprocess.run([self.zelctl, "--home", folder, "analyse", str(view), *options,
                                  "--json"], capture_output=True, text=True, check=False)
        self.same("status of " + " ".join(options), run.returncode, status)
        return [json.loads(line) for line in run.stdout.splitlines()]

    def same(self, what, ours, theirs, close=CLOSE):
        self.done += 1
        if ours is None or theirs is None:
            good = ours is theirs
        else:
            good = np.shape(ours) == np.shape(theirs) and np.allclose(ours, theirs, rtol=1e-12,
                                                                     atol=close)
        if not good:
            self.failed.append(f"{what}: {ours} instead of {theirs}")


def peaks_of(levels, excursion, threshold=-1000):
    """A fall past the border counts: the trace goes on far below."""
    padded = np.concatenate([[-1e9], levels, [-1e9]])
    found, _ = find_peaks(padded, prominence=excursion, height=threshold)
    result = []
    for at in found - 1:
        if 0 < at < len(levels) - 1 and np.ptp(levels[at - 1:at + 2]) > 0:
            a, b, c = np.polyfit([-1, 0, 1], levels[at - 1:at + 2], 2)
            shift = -b / (2 * a) if a else 0
            result.append((X[at] + shift * STEP, np.polyval([a, b, c], shift)))
        else:
            result.append((X[at], levels[at]))
    return sorted(result, key=lambda peak: (-peak[1], peak[0]))


def check_peaks(check, name, levels):
    wanted = peaks_of(levels, 6, -95)[:20]
    got = check.ask(saved(levels), "--peaks", "20", "--threshold", "-95")[0]["peaks"]
    check.same(name + ", number of peaks", len(got), len(wanted))
    for ours, (x, level) in zip(got, wanted):
        check.same(name + ", x of a peak", ours["x"], x, close=0.01)
        check.same(name + ", level of a peak", ours["level"], level)


def check_widths(check, name, levels, down):
    top_x, top = peaks_of(levels, 6)[0]
    at = int(np.argmax(levels))
    left = np.interp(top - down, levels[:at + 1][np.argmax(levels[:at + 1] > top - down) - 1:at + 1],
                     X[:at + 1][np.argmax(levels[:at + 1] > top - down) - 1:at + 1])
    right_levels = levels[at:]
    end = int(np.argmax(right_levels < top - down))
    right = np.interp(top - down, right_levels[end::-1], X[at:][end::-1])
    got = check.ask(saved(levels), "--bandwidth", str(down))[0]["bandwidth"]
    check.same(name + ", low edge", got["low"], left, close=0.01)
    check.same(name + ", high edge", got["high"], right, close=0.01)
    check.same(name + ", peak", got["x"], top_x, close=0.01)


def check_powers(check, name, levels):
    power = 10 ** (levels / 10)
    middle = X[POINTS // 2]
    stretches = [(X[0], X[-1]), (X[0], middle), (X[POINTS // 2 + 1], X[-1])]
    options = [word for start, stop in stretches for word in ("--channel", f"{start:.0f},{stop:.0f}")]
    channels = check.ask(saved(levels), *options)[0]["channels"]
    for (start, stop), ours in zip(stretches, channels):
        inside = (X >= start) & (X <= stop)
        check.same(name + ", channel", ours["power"],
                   10 * np.log10(STEP / RBW * power[inside].sum()))
    whole, *halves = (10 ** (channel["power"] / 10) for channel in channels)
    check.same(name + ", halves sum to the whole", 10 * np.log10(sum(halves)), 10 * np.log10(whole))
    for percent in (50, 99):
        grown = np.cumsum(power) - power / 2
        edges = np.interp([(100 - percent) / 200 * power.sum(), (100 + percent) / 200 * power.sum()],
                          grown, X)
        got = check.ask(saved(levels), "--occupied", str(percent))[0]["occupied"]
        check.same(name + ", occupied", [got["low"], got["high"]], edges, close=0.01)


def check_mask(check, name, levels):
    rows_x = [X[20], X[120], X[260]]
    upper = [-40.0, -20.0, -60.0]
    with tempfile.TemporaryDirectory() as folder:
        mask = Path(folder, "mask.csv")
        mask.write_text("x;upper;lower\n" + "".join(f"{x!r};{level!r};\n" for x, level in
                                                    zip(map(float, rows_x), upper)))
        covered = (X >= rows_x[0]) & (X <= rows_x[-1])
        margins = np.interp(X[covered], rows_x, upper) - levels[covered]
        fails = bool(margins.min() < 0)
        got = check.ask(saved(levels), "--mask", str(mask), status=3 if fails else 0)[0]["mask"]
    check.same(name + ", pass", got["pass"], not fails)
    check.same(name + ", margin", got["margin"], margins.min())
    check.same(name + ", its x", got["x"], X[covered][np.argmin(margins)])


def check_holds(check, random):
    traces = np.round(random.normal(-90, 4, (25, POINTS)), 6)
    text = "".join(saved(trace) for trace in traces)
    options = ("--channel", f"{X[0]:.0f},{X[-1]:.0f}", "--occupancy", "-88")
    held = {"max": traces.max(axis=0), "min": traces.min(axis=0), "average": traces.mean(axis=0),
            "power": 10 * np.log10((10 ** (traces / 10)).mean(axis=0))}
    for kind, levels in held.items():
        got = check.ask(text, "--hold", kind, *options)[0]
        check.same("hold " + kind, got["channels"][0]["power"],
                   10 * np.log10(STEP / RBW * (10 ** (levels / 10)).sum()))
        check.same("occupancy", got["occupancy"], (traces >= -88).mean(axis=0))


def check_formulas(check):
    """Closed formulas: nothing of them is worked out of the samples."""
    center = X[150] + 0.3 * STEP
    got = check.ask(saved(gaussian(center, -20)), "--peaks", "1", "--bandwidth", "3")[0]
    check.same("a filter's centre", got["peaks"][0]["x"], center, close=0.01)
    check.same("a filter's top", got["peaks"][0]["level"], -20)
    check.same("a filter's 3 dB width", got["bandwidth"]["width"],
               RBW * math.sqrt(3 / (10 * math.log10(2))), close=0.02 * RBW)
    area, _ = quad(lambda x: 10 ** ((-20 - 10 * math.log10(2) * (x / (RBW / 2)) ** 2) / 10),
                   -20 * RBW, 20 * RBW, points=[0])
    whole = check.ask(saved(gaussian(center, -20)), "--channel", f"{X[0]:.0f},{X[-1]:.0f}")[0]
    check.same("a filter's power", whole["channels"][0]["power"], 10 * math.log10(area / RBW),
               close=1e-3)


def main():
    check = Check(sys.argv[1])
    random = np.random.default_rng(20260122)
    noise = np.round(random.normal(-100, 2, POINTS), 6)
    flat = np.full(POINTS, -100.0)
    two = added(gaussian(X[100] + 30e3, -20), gaussian(X[190] - 45e3, -35), flat)
    traces = {
        "a filter": added(gaussian(X[150] + 20e3, -30), flat),
        "two tones": two,
        "two tones in noise": added(two, noise),
        "noise": noise,
        "a flat top": np.where((X >= X[100]) & (X <= X[103]), -30.0, flat),
    }
    for name, levels in traces.items():
        check_peaks(check, name, levels)
        check_powers(check, name, levels)
        check_mask(check, name, levels)
    for name in ("a filter", "two tones"):
        check_widths(check, name, traces[name], 3)
        check_widths(check, name, traces[name], 20)
    check_holds(check, random)
    check_formulas(check)
    # Pairs: as if the highest levels alone had been swept, but for the last point.
    got = check.ask(saved_pairs(noise, two), "--peaks", "2")[0]["peaks"]
    for ours, (x, level) in zip(got, peaks_of(np.append(two[:-1], noise[-1]), 6)):
        check.same("pairs, x of a peak", ours["x"], x, close=0.01)
        check.same("pairs, level of a peak", ours["level"], level)
    got = check.ask(saved(two, zero_span=True), "--peaks", "1")[0]["peaks"][0]
    check.same("zero span, time of the peak", got["x"], (peaks_of(two, 6)[0][0] - START) / STEP
               * 0.6 / 300)
    for failure in check.failed:
        print(failure)
    print(f"{check.done - len(check.failed)} of {check.done} figures agree")
    return 1 if check.failed or check.done < 100 else 0


sys.exit(main())
