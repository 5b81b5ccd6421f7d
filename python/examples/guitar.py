"""Finds fingerings, and names what is held."""

import brindle

for fingering in brindle.fingerings("Am7", limit=3):
    print(fingering, fingering.name, fingering.difficulty)
print(brindle.fingerings("G", tuning="ukulele", limit=1)[0])
print(brindle.fretted("200232").name)

chord = brindle.Chord("F#m7b5/C")
print(" ".join(note.name(unicode=True) for note in chord.notes))
try:
    brindle.Chord("Cmay7")
except brindle.ChordError as error:
    print(f"{error.text} at {error.position}: {error}")
