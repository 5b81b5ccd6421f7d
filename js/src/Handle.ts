import type { Native } from "./Native.js";

interface Freed {
  native: Native;
  free: `_brindle_${string}`;
  handle: number;
}

const registry = new FinalizationRegistry<Freed>(({ native, free, handle }) => {
  native.module[free]!(handle);
});

/** Something of the library that is freed with the object that stands for it, or before, by free(). */
export abstract class Handle {
  #freed: Freed;

  /** @internal */
  constructor(
    protected readonly native: Native,
    free: `_brindle_${string}`,
    handle: number,
  ) {
    this.#freed = { native, free, handle };
    registry.register(this, this.#freed, this);
  }

  /** @internal */
  get handle(): number {
    if (this.#freed.handle === 0) throw new Error("this was freed");
    return this.#freed.handle;
  }

  /** Gives its memory back at once; it cannot be used any more. */
  free(): void {
    const { native, free, handle } = this.#freed;
    if (handle === 0) return;
    registry.unregister(this);
    native.module[free]!(handle);
    this.#freed = { native, free, handle: 0 };
  }
}

const dispose: unique symbol = (Symbol as { dispose?: symbol }).dispose as never;
if (dispose !== undefined) {
  Object.defineProperty(Handle.prototype, dispose, {
    value(this: Handle) {
      this.free();
    },
  });
}
