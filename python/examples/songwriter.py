"""Writes a song to a few wishes, and tells what may come behind its last chords."""

import brindle

model = brindle.SongModel.built_in("hymn")
written = model.write_song(key="G", bars=8, contains="ii V I", seed=3)
print(written.text)
last = [chord.chord for chord in written.song[-2:]]
for next in model.next_chords(last, key="G", limit=3):
    print(f"{str(next.chord):4} {next.numeral:4} {next.probability:.2f}")

try:
    model.write_song(begins="G", never="G", key="G")
except brindle.ModelError as error:
    print(error)
