import { useEffect, useState } from "preact/hooks";
import { examples, type Example } from "../song/examples";
import { recall, remember } from "./store";

type Theme = "auto" | "light" | "dark";

/** The colours of the page; "auto" are those that the system prefers. */
function useTheme(): [Theme, (theme: Theme) => void] {
  const [theme, setTheme] = useState<Theme>(() => {
    const kept = recall("theme");
    return kept === "light" || kept === "dark" ? kept : "auto";
  });
  useEffect(() => {
    document.documentElement.dataset.theme = theme;
    remember("theme", theme);
  }, [theme]);
  return [theme, setTheme];
}

/** The head of the page: its name, files, examples, colours. */
export function Masthead({ onFile, onExample }: { onFile(file: File): void; onExample(example: Example): void }) {
  const [theme, setTheme] = useTheme();
  return (
    <header class="masthead">
      <h1>Brindle</h1>
      <p class="motto">a song, read like a teacher reads it</p>
      <div class="tools">
        <label class="open">
          <input
            type="file"
            class="unseen"
            accept=".txt,.cho,.chopro,.chordpro,.pro,.musicxml,.mxl,.xml,.html,text/plain"
            onChange={(event) => {
              const file = event.currentTarget.files?.[0];
              if (file) onFile(file);
              event.currentTarget.value = "";
            }}
          />
          <span>Open a file</span>
        </label>
        <label>
          <span class="unseen">Example</span>
          <select
            class="examples"
            value=""
            onChange={(event) => {
              const example = examples[Number(event.currentTarget.value)];
              if (example) onExample(example);
              event.currentTarget.value = "";
            }}
          >
            <option value="" disabled>Examples</option>
            {examples.map(({ title }, i) => (
              <option key={title} value={i}>{title}</option>
            ))}
          </select>
        </label>
        <label>
          <span class="unseen">Colours</span>
          <select class="theme" value={theme} onChange={(event) => setTheme(event.currentTarget.value as Theme)}>
            <option value="auto">Auto</option>
            <option value="light">Light</option>
            <option value="dark">Dark</option>
          </select>
        </label>
      </div>
    </header>
  );
}
