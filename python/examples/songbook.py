"""Reads a song and tells what each chord does."""

import brindle

song = brindle.read(
    """{title: A tune}
[C]Once there [A7]was a [Dm7]tune [G7]that
[C]nobody [E7]knew [Am]yet
"""
)
analysis = song.analyse(explain=True)
print(f"{song.title}, in {analysis.key}")
for chord in analysis:
    print(f"{chord.symbol:4} {chord.numeral:6} {chord.function:12} {chord.explanation}")

with open("tune.svg", "w", encoding="utf-8") as picture:
    picture.write(analysis.svg(theme="light"))
