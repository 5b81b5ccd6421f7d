import { useEffect, useState } from "preact/hooks";

/** What a promise gives, once it does, or why it does not; nothing while another one is awaited. */
export function useLoaded<Value>(load: () => Promise<Value>, inputs: unknown[]): { value: Value | null; error: string } {
  const [state, setState] = useState<{ value: Value | null; error: string }>({ value: null, error: "" });
  useEffect(() => {
    let isWanted = true;
    const tell = (value: Value | null, error = "") => isWanted && setState({ value, error });
    tell(null);
    load().then((value) => tell(value), (error: Error) => tell(null, error.message));
    return () => {
      isWanted = false;
    };
  }, inputs);
  return state;
}
