import type { Note } from "../engine/Types";
import { Sampler } from "./Sampler";

export interface PlayOptions {
  /** Beats a minute. */
  tempo: number;
  /** Beats that are counted before. */
  countIn: number;
  /** The beat of the song that it begins at. */
  from: number;
  /** Where the song ends, in beats. */
  end: number;
}

/** Seconds that notes are sent ahead of the clock, and how often that is looked after. */
const lookAhead = 0.25;
const interval = 60;

/** Plays notes by the clock of the sound, so that no other work makes it stumble. */
export class Player {
  private context: AudioContext | null = null;
  private sampler: Promise<Sampler> | null = null;
  private piano: Sampler | null = null;
  private timer = 0;
  private frame = 0;
  private notes: Note[] = [];
  private next = 0;
  /** Counts what was asked for: what waits for the sound is not played once something else is wanted. */
  private wish = 0;
  private options: PlayOptions = { tempo: 120, countIn: 0, from: 0, end: 0 };
  /** The time of the audio clock at which the beat `beatThen` sounds. */
  private timeThen = 0;
  private beatThen = 0;

  /** `onBeat` hears where the song is, in beats, negative while it is counted in; null at the end. */
  constructor(private readonly onBeat: (beat: number | null) => void) {}

  get isPlaying(): boolean {
    return this.timer !== 0;
  }

  /** Loads the sound if need be and starts; refuses if there is no sound. */
  async play(notes: Promise<Note[]>, options: PlayOptions): Promise<void> {
    const wish = ++this.wish;
    // The sound is woken by the click itself; phones allow it at no later time.
    const [piano, found] = await Promise.all([this.ready(), notes]);
    if (wish !== this.wish) return;
    this.halt();
    piano.sound();
    this.notes = [...found].sort((a, b) => a.Position - b.Position);
    this.options = options;
    this.next = this.notes.findIndex((note) => note.Position >= options.from - 1e-6);
    if (this.next < 0) this.next = this.notes.length;
    this.beatThen = options.from - options.countIn;
    this.timeThen = piano.context.currentTime + 0.12;
    for (let i = 0; i < options.countIn; ++i) piano.click(i === 0, this.timeOf(this.beatThen + i));
    this.timer = window.setInterval(() => this.send(), interval);
    this.send();
    this.follow();
  }

  /** Sounds a chord once. */
  async hear(noteNrs: number[]): Promise<void> {
    const piano = await this.ready();
    if (!this.isPlaying) piano.sound();
    const now = piano.context.currentTime + 0.03;
    noteNrs.forEach((noteNr, i) => piano.play(noteNr, 80, now + i * 0.018, 1.6));
  }

  setTempo(tempo: number): void {
    if (this.isPlaying && this.piano) {
      const now = this.piano.context.currentTime;
      this.beatThen = this.beat();
      this.timeThen = now;
    }
    this.options = { ...this.options, tempo };
  }

  stop(): void {
    ++this.wish;
    this.halt();
    this.onBeat(null);
  }

  private async ready(): Promise<Sampler> {
    this.context ??= new AudioContext();
    const woken = this.context.resume();
    this.sampler ??= Sampler.load(this.context);
    try {
      this.piano = await this.sampler;
    } catch (error) {
      // The next click tries again.
      this.sampler = null;
      throw error;
    }
    await woken;
    return this.piano;
  }

  private halt(): void {
    window.clearInterval(this.timer);
    cancelAnimationFrame(this.frame);
    if (this.isPlaying) this.piano?.hush();
    this.timer = 0;
  }

  private beat(): number {
    const seconds = this.piano!.context.currentTime - this.timeThen;
    return this.beatThen + (seconds * this.options.tempo) / 60;
  }

  private timeOf(beat: number): number {
    return this.timeThen + ((beat - this.beatThen) * 60) / this.options.tempo;
  }

  private send(): void {
    const until = this.piano!.context.currentTime + lookAhead;
    for (; this.next < this.notes.length; ++this.next) {
      const note = this.notes[this.next]!;
      const time = this.timeOf(note.Position);
      if (time > until) break;
      const length = (note.Length * 60) / this.options.tempo;
      this.piano!.play(note.NoteNr, note.Velocity, Math.max(time, 0), length);
    }
    if (this.beat() >= this.options.end) this.stop();
  }

  private follow(): void {
    if (!this.isPlaying) return;
    this.onBeat(this.beat());
    this.frame = requestAnimationFrame(() => this.follow());
  }
}
