"""Analyses many songs at once and counts what their chords do."""

from collections import Counter

import brindle

songs = ["Dm7 G7 | C . . .", "Am . E7 . | Am . . .", "what is this?"]
batch = brindle.analyse_batch(songs, threads=2)

for key, faults in zip(batch.column("key").to_pylist(), batch.column("faults").to_pylist()):
    print(key, [fault["text"] for fault in faults])
functions = Counter(
    chord["function"] for chords in batch.column("chords").to_pylist() for chord in chords
)
print(functions.most_common())
