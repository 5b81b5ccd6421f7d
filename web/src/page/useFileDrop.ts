import { useEffect, useState } from "preact/hooks";

/** Files that are dropped anywhere on the page; tells whether one is held over it. */
export function useFileDrop(onFile: (file: File) => void): boolean {
  const [isOver, setIsOver] = useState(false);
  useEffect(() => {
    const over = (event: DragEvent) => {
      if (!event.dataTransfer?.types.includes("Files")) return;
      event.preventDefault();
      setIsOver(true);
    };
    const leave = (event: DragEvent) => {
      if (event.relatedTarget === null) setIsOver(false);
    };
    const drop = (event: DragEvent) => {
      setIsOver(false);
      const file = event.dataTransfer?.files[0];
      if (!file) return;
      event.preventDefault();
      onFile(file);
    };
    window.addEventListener("dragover", over);
    window.addEventListener("dragleave", leave);
    window.addEventListener("drop", drop);
    return () => {
      window.removeEventListener("dragover", over);
      window.removeEventListener("dragleave", leave);
      window.removeEventListener("drop", drop);
    };
  }, [onFile]);
  return isOver;
}
