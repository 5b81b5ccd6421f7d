import type { Answer, Call, Calls } from "./Types";

/** What goes wrong in the library, in words for people. */
export class EngineError extends Error {}

interface Waiting {
  resolve(value: unknown): void;
  reject(error: Error): void;
  /** Of the timer that gives the worker up. */
  timer: number;
}

/** Milliseconds after which a worker is given up. */
const patience = 20_000;

/**
 * The library in a worker, so that typing never waits for it. A worker that dies (out of memory on
 * a hostile file, say) is replaced; the calls it had are refused, the next ones work.
 */
export class Engine {
  private worker: Worker | null = null;
  private waiting = new Map<number, Waiting>();
  private next = 0;

  call<Name extends keyof Calls>(
    name: Name,
    ...args: Parameters<Calls[Name]>
  ): Promise<Awaited<ReturnType<Calls[Name]>>> {
    this.worker ??= this.start();
    const id = this.next++;
    const call: Call = { id, name, args };
    return new Promise((resolve, reject) => {
      const timer = window.setTimeout(() => this.replace("This takes too long."), patience);
      this.waiting.set(id, { resolve: resolve as (value: unknown) => void, reject, timer });
      this.worker?.postMessage(call);
    });
  }

  private start(): Worker {
    const worker = new Worker(new URL("./worker.ts", import.meta.url), { type: "module" });
    worker.onmessage = ({ data }: MessageEvent<Answer>) => this.answer(data);
    worker.onerror = (event) => this.replace(event.message || "the library did not load");
    return worker;
  }

  private answer(answer: Answer): void {
    if (answer.isFatal) return this.replace(answer.error ?? "the library stopped");
    const waiting = this.waiting.get(answer.id);
    this.waiting.delete(answer.id);
    clearTimeout(waiting?.timer);
    if (answer.error !== undefined) waiting?.reject(new EngineError(answer.error));
    else waiting?.resolve(answer.value);
  }

  private replace(reason: string): void {
    this.worker?.terminate();
    this.worker = null;
    for (const { reject, timer } of this.waiting.values()) {
      clearTimeout(timer);
      reject(new EngineError(reason));
    }
    this.waiting.clear();
  }
}
