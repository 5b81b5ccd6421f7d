import type { Native } from "./Native.js";

/** Reads and writes a record of C from its begin, field by field, each where its alignment puts it. */
export class Record {
  constructor(
    private readonly native: Native,
    private at: number,
  ) {}

  int(): number {
    return this.native.view.getInt32(this.place(4), true);
  }
  size(): number {
    return this.native.view.getUint32(this.place(4), true);
  }
  double(): number {
    return this.native.view.getFloat64(this.place(8), true);
  }
  /** An int64_t that is an index, null for -1. */
  index(): number | null {
    const index = Number(this.native.view.getBigInt64(this.place(8), true));
    return index < 0 ? null : index;
  }
  text(): string {
    return this.native.text(this.size());
  }
  ints(count: number): number[] {
    return Array.from({ length: count }, () => this.int());
  }

  putInt(value: number): this {
    this.native.view.setInt32(this.place(4), value, true);
    return this;
  }
  putDouble(value: number): this {
    this.native.view.setFloat64(this.place(8), value, true);
    return this;
  }
  /** A uint64_t. */
  putLong(value: bigint): this {
    this.native.view.setBigUint64(this.place(8), value, true);
    return this;
  }

  private place(size: number): number {
    const at = Math.ceil(this.at / size) * size;
    this.at = at + size;
    return at;
  }
}
