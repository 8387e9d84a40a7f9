"""The table of the benchmarks as a picture: a line for each operation, a mark for each contender."""

import subprocess

SETTINGS = """
set terminal svg size 900,{height} dynamic font "sans-serif,11" background "white"
set output "{path}"
set logscale x
set format x "%g"
set xlabel "time, as a multiple of the fastest peer's"
set yrange [-1:{lines}] noextend
set ytics font ",10"
set grid xtics linewidth 0.5 linecolor "#cccccc"
set key outside top center horizontal
set arrow from first 1, graph 0 to first 1, graph 1 nohead linewidth 1 linecolor "#888888"
plot $peers using 1:2 with points pointtype 1 pointsize 0.6 linecolor "#999999" title "other peers", \\
     $fastest using 1:2 with points pointtype 2 pointsize 0.7 linecolor "#c46a1b" title "fastest peer", \\
     $ours using 1:2:yticlabels(3) with points pointtype 7 pointsize 0.6 linecolor "#1b5e9e" title "ours"
"""


def relative_times(contenders):
    """Our time and the sorted ones of the peers, as multiples of the fastest peer's; or nothing."""
    best = {name: min(variants.values()) for name, variants in contenders.items()}
    ours = best.pop("ours", None)
    if ours is None or not best:
        return None
    fastest = min(best.values())
    return ours / fastest, sorted(time / fastest for time in best.values())


def block(name, lines):
    return f"${name} << END\n" + "\n".join(lines) + "\nEND\n"


def draw(rows, path):
    """Writes an SVG of `rows`, which are {operation: {contender: {variant: time}}}, by gnuplot."""
    measured = [(operation, relative_times(contenders)) for operation, contenders in rows.items()]
    measured = [(operation, times) for operation, times in measured if times]
    ours, fastest, peers = [], [], []
    for height, (operation, (our_time, peer_times)) in enumerate(reversed(measured)):
        ours.append(f'{our_time:.4g} {height} "{operation}"')
        fastest.append(f"1 {height}")
        peers += [f"{time:.4g} {height}" for time in peer_times[1:]]
    if not measured:
        return False
    # Where no operation has a second peer, one mark beyond the picture stands for the list.
    script = (block("ours", ours) + block("fastest", fastest) + block("peers", peers or ["1 -9"]) +
              SETTINGS.format(height=110 + 15 * len(measured), lines=len(measured), path=path))
    subprocess.run(["gnuplot"], input=script, text=True, check=True)
    return True
