/* SPDX-License-Identifier: MIT */
#ifndef BRINDLE_C_BRINDLE_H
#define BRINDLE_C_BRINDLE_H

/*
 * Brindle for C and for all languages that reach a library through C. Plain C11.
 *
 * Texts. All texts, also those that are handed in, are UTF-8 and end with a NUL. A `const char*`
 * that a function gives belongs to the handle that it was asked of, or to the library, and is not
 * freed. A `char**` receives a text of the caller's own, to be freed with brindle_free.
 *
 * Handles. Each has a function that frees it, which takes NULL, too. A handle keeps what it was
 * made of: a song may be freed while its analysis lives.
 *
 * Errors. A function that can fail gives a brindle_status; then what it was to fill is NULL or
 * undefined, and brindle_last_error tells the calling thread what is wrong. NULL where a handle, a
 * text or a place for a result is needed is BRINDLE_ERROR_ARGUMENT, unless NULL is said to be
 * allowed; so is an index out of range. A function that gives a value or a text of a handle gives
 * 0 or "" for NULL. Nothing is thrown across this border.
 *
 * Threads. All functions may be called from several threads at once, each on handles of its own. A
 * handle that nobody changes may be read by several threads: songs, analyses, names and grids
 * never change, finding in a grid package or generating with a model counts as change. The three
 * functions that set up the library are to be called before other threads use it.
 *
 * Enumerators. Where a value goes in or out of a record it is an int, so that any number may come
 * in; one that is no enumerator is an error or counts as 0.
 *
 * Positions and lengths are beats from the beginning of the song: quarter notes in a score, what
 * the song itself counts in a text.
 */

#include <stddef.h>
#include <stdint.h>

#if defined(BRINDLE_API)
#elif defined(_WIN32) && defined(BRINDLE_SHARED)
#define BRINDLE_API __declspec(dllimport)
#elif defined(__GNUC__)
#define BRINDLE_API __attribute__((visibility("default")))
#else
#define BRINDLE_API
#endif

#ifdef __cplusplus
extern "C" {
#endif

/* Version */

/* Grows by one with each change of this header that a host must be compiled anew for. */
#define BRINDLE_API_VERSION 1

/* The version of the library that runs, "0.1.0". */
BRINDLE_API const char* brindle_version(void);
/* The BRINDLE_API_VERSION that the library that runs was built with. */
BRINDLE_API int brindle_api_version(void);

/* Errors */

typedef enum brindle_status {
    BRINDLE_OK = 0,
    BRINDLE_ERROR_ARGUMENT = 1,  /* NULL, an index or a value out of range */
    BRINDLE_ERROR_INPUT = 2,     /* a text or bytes that are not what they should be */
    BRINDLE_ERROR_FILE = 3,      /* a file that cannot be read or written */
    BRINDLE_ERROR_NOT_FOUND = 4, /* what was asked for is not there */
    BRINDLE_ERROR_MEMORY = 5,
    BRINDLE_ERROR_INTERNAL = 6 /* a fault of the library */
} brindle_status;

/* What was wrong with the last call of this thread that gave a status; "" if it gave BRINDLE_OK.
 * Valid until the next such call of the thread. */
BRINDLE_API const char* brindle_last_error(void);
/* Where that was in the text that was handed in, in characters (not bytes) from 1; 0 for nowhere.
 */
BRINDLE_API size_t brindle_last_error_position(void);

/* Frees what a `char**` received; NULL is allowed. */
BRINDLE_API void brindle_free(char* text);

/* Set-up, before other threads use the library */

/* Where the data lie that come with the library (the folder with "Chord Grids"); NULL for where
 * they were installed. */
BRINDLE_API brindle_status brindle_set_data_folder(const char* path);
/* The folder with translations, `<language>/LC_MESSAGES/brindle.mo`; texts are in the language that
 * the host has set with setlocale. */
BRINDLE_API brindle_status brindle_set_locale_folder(const char* path);

/* Receives what an import remarks beside its events; it must not throw or jump. */
typedef void (*brindle_alert_handler)(const char* heading, const char* text, void* context);
/* Receives all alerts, on the thread that they come from; NULL for the default, which writes them
 * to standard error. `context` is handed on as it is. */
BRINDLE_API brindle_status brindle_set_alert_handler(brindle_alert_handler handler, void* context);

/* Tones, keys and scales: plain values, which may be copied and made by hand */

/* The accidental of a tone without spelling, and the pitch class of none. */
#define BRINDLE_UNSPELLED 127
#define BRINDLE_NONE (-1)

/* A spelled pitch class: {1, 1} is C sharp and {1, -1} is D flat. */
typedef struct brindle_tone {
    int pitch_class; /* 0 (C) to 11 (B); BRINDLE_NONE for none */
    int accidental;  /* -3 (triple flat) to 3 (triple sharp), or BRINDLE_UNSPELLED */
} brindle_tone;

typedef enum brindle_mode {
    BRINDLE_MODE_NONE = 0,
    BRINDLE_MODE_MAJOR = 1,
    BRINDLE_MODE_MINOR = 2
} brindle_mode;

/* A major or minor key; undefined without tonic or mode. */
typedef struct brindle_key {
    brindle_tone tonic;
    int mode; /* a brindle_mode */
} brindle_key;

typedef struct brindle_scale {
    brindle_tone root;
    uint32_t mask; /* bit n is n semitones above the root */
} brindle_scale;

/* What tones are called. */
typedef enum brindle_naming {
    BRINDLE_NAMING_LETTERS = 0, /* C D E F G A B */
    BRINDLE_NAMING_GERMAN = 1,  /* B is written H, and B flat is B */
    BRINDLE_NAMING_SOLFEGE = 2  /* Do Re Mi Fa Sol La Si */
} brindle_naming;

typedef struct brindle_style {
    int naming;        /* a brindle_naming */
    int unicode_signs; /* not 0: the signs U+266F and U+266D in place of # and b */
} brindle_style;

/* The name of a tone, "Bb". `style` may be NULL for letters in ASCII, here and below. */
BRINDLE_API brindle_status brindle_tone_write(const brindle_tone* tone, const brindle_style* style,
                                              char** text);
/* Reads "F# minor", "Bb", "am". */
BRINDLE_API brindle_status brindle_key_read(const char* text, brindle_key* key);
/* "Bb Minor". */
BRINDLE_API brindle_status brindle_key_write(const brindle_key* key, char** text);
/* Sharps of the signature, flats as a negative number; 0 for NULL and an undefined key. */
BRINDLE_API int brindle_key_signature(const brindle_key* key);
/* The key of the other mode with the same signature: A minor for C major. */
BRINDLE_API brindle_status brindle_key_relative(const brindle_key* key, brindle_key* relative);
/* Major or natural minor. */
BRINDLE_API brindle_status brindle_key_scale(const brindle_key* key, brindle_scale* scale);

/* Reads "D dorian", "Bb blues minor". */
BRINDLE_API brindle_status brindle_scale_read(const char* text, brindle_scale* scale);
/* "D Dorian"; "D Custom" for a scale without a name. */
BRINDLE_API brindle_status brindle_scale_write(const brindle_scale* scale, char** text);
/* The tones from the root up as they are spelled. `tones` has room for 12 and `count` receives how
 * many there are. */
BRINDLE_API brindle_status brindle_scale_tones(const brindle_scale* scale, brindle_tone tones[12],
                                               size_t* count);

/* Chords: plain values */

typedef struct brindle_chord {
    brindle_tone root; /* none for no chord */
    brindle_tone bass; /* what stands behind the slash; none without one */
    uint32_t mask;     /* bit n is n semitones above the root, bit 0 the root itself */
} brindle_chord;

/* How a chord symbol is read; to be joined by |. */
enum {
    BRINDLE_READ_B_IS_B_FLAT = 1,     /* the letter B is B flat, H is B natural */
    BRINDLE_READ_SOLFEGE = 2,         /* roots may be syllables */
    BRINDLE_READ_LOWER_CASE_MINOR = 4 /* a root in lower case without a quality is minor */
};

/* Reads a chord symbol as people write it: "F#m7/C#", "Co7", "Ab:min7/b3". "N.C." gives the chord
 * without root. A sign that repeats the chord before is BRINDLE_ERROR_INPUT. */
BRINDLE_API brindle_status brindle_chord_read(const char* symbol, unsigned flags,
                                              brindle_chord* chord);
/* The symbol of a chord as people type it, "E7b9"; it reads back as the same chord. "N.C." for no
 * chord. */
BRINDLE_API brindle_status brindle_chord_write(const brindle_chord* chord,
                                               const brindle_style* style, char** symbol);
/* The tones from the root up as the chord spells them; without a bass that is none of them. */
BRINDLE_API brindle_status brindle_chord_tones(const brindle_chord* chord, brindle_tone tones[12],
                                               size_t* count);

/* Names of notes */

typedef struct brindle_names brindle_names;

typedef enum brindle_bass_use {
    BRINDLE_BASS_USUAL = 0, /* the lowest note is the bass, of the chord or foreign to it */
    BRINDLE_BASS_ONLY = 1,  /* it is only the bass, the chord is above it */
    BRINDLE_BASS_NONE = 2   /* it says nothing, as on a ukulele */
} brindle_bass_use;

typedef struct brindle_naming_options {
    brindle_key key;   /* of the piece; undefined if it is not known */
    int previous_root; /* pitch classes of the roots before and behind, or BRINDLE_NONE */
    int next_root;
    int bass;     /* a brindle_bass_use */
    size_t limit; /* most names that are wanted */
} brindle_naming_options;

/* A name of some notes. The texts belong to the brindle_names. */
typedef struct brindle_name {
    const char* symbol;       /* "Dm7/C" */
    const char* exact_symbol; /* the same with all that is left out: "C7(no5)" */
    brindle_chord chord;
    int cost; /* how unusual the name is, in tenths of a bit */
} brindle_name;

/* No key, no neighbours, usual bass, 12 names. */
BRINDLE_API brindle_naming_options brindle_naming_options_default(void);
/* Names notes, MIDI numbers of 0 to 127 in any order, as players say them, the likeliest name
 * first, at most one for each root. `options` may be NULL for the default. Without notes there are
 * no names, which is no error. */
BRINDLE_API brindle_status brindle_names_of_notes(const int* notes, size_t count,
                                                  const brindle_naming_options* options,
                                                  brindle_names** names);
BRINDLE_API void brindle_names_free(brindle_names* names);
BRINDLE_API size_t brindle_names_count(const brindle_names* names);
BRINDLE_API brindle_status brindle_names_get(const brindle_names* names, size_t index,
                                             brindle_name* name);

/* Songs */

typedef struct brindle_song brindle_song;

typedef enum brindle_format {
    BRINDLE_FORMAT_AUTO = 0,       /* whichever of these it looks like */
    BRINDLE_FORMAT_CHORD_TEXT = 1, /* Dm7 G7 | C . . . */
    BRINDLE_FORMAT_EVEN_TEXT = 2,  /* the same, the chords of a bar share it evenly */
    BRINDLE_FORMAT_CHORDS_ABOVE_LYRICS = 3,
    BRINDLE_FORMAT_CHORD_PRO = 4, /* lyrics with [C], {title: ...} */
    BRINDLE_FORMAT_CHART = 5,     /* {*AT44C^7 |A-7 D7 } */
    BRINDLE_FORMAT_CHART_LINK = 6,
    BRINDLE_FORMAT_CHART_PAGE = 7,
    BRINDLE_FORMAT_CHORD_STRINGS = 8, /* (4,C);(2,G7), one sequence a line */
    BRINDLE_FORMAT_MUSICXML = 9,
    BRINDLE_FORMAT_COMPRESSED_MUSICXML = 10,
    BRINDLE_FORMAT_ROMAN_TEXT = 11 /* m1 C: I b3 V65/V */
} brindle_format;

typedef struct brindle_song_options {
    int format;             /* a brindle_format */
    double beats_per_bar;   /* of a text that does not tell; above 0 */
    double beats_per_chord; /* how far a chord moves on in such a text; above 0 */
    int even;               /* not 0: the chords of a bar without holds share it evenly */
    int lenient;            /* not 0: what is not understood is left out, and all faults are told */
    unsigned chord_flags;   /* BRINDLE_READ_... */
} brindle_song_options;

/* Any format, 4 beats a bar, 1 beat a chord, strict. */
BRINDLE_API brindle_song_options brindle_song_options_default(void);

/* What is wrong with a song, or was left out of it. */
typedef struct brindle_fault {
    size_t line;   /* from 1; 0 where it is the whole song */
    size_t column; /* in characters from 1 */
    int is_note;   /* not 0: all chords are there, something else was left out */
    const char* text;
} brindle_fault;

typedef struct brindle_song_chord {
    double position;
    double length;
    const char* symbol; /* as it was written */
    brindle_chord chord;
} brindle_song_chord;

typedef struct brindle_bar {
    const char* number; /* as printed, "12" */
    double position;
    double length;
    int time_numerator; /* 0 where the song does not tell */
    int time_denominator;
} brindle_bar;

typedef struct brindle_section {
    const char* name; /* may be "" */
    double position;
} brindle_section;

/* Reads a song in any form, played through its repeats, endings and jumps. Bytes that make no sense
 * are no error: their song has faults, and without BRINDLE_OK there is no song. Of a source with
 * many songs it is the first. `options` may be NULL for the default, `bytes` if `size` is 0. */
BRINDLE_API brindle_status brindle_song_read(const void* bytes, size_t size,
                                             const brindle_song_options* options,
                                             brindle_song** song);
/* The same for a file. One that cannot be read or is larger than 256 MiB is a fault of the song. */
BRINDLE_API brindle_status brindle_song_read_file(const char* path,
                                                  const brindle_song_options* options,
                                                  brindle_song** song);
BRINDLE_API void brindle_song_free(brindle_song* song);

/* Not 0 if there is a fault that is no note; the song then has no chords, unless it was read
 * leniently. */
BRINDLE_API int brindle_song_has_fault(const brindle_song* song);
BRINDLE_API size_t brindle_song_fault_count(const brindle_song* song);
BRINDLE_API brindle_status brindle_song_fault(const brindle_song* song, size_t index,
                                              brindle_fault* fault);
/* What it was read as, never BRINDLE_FORMAT_AUTO but for NULL. */
BRINDLE_API brindle_format brindle_song_format(const brindle_song* song);
BRINDLE_API const char* brindle_song_title(const brindle_song* song);
/* Composers, artists and writers of the words. */
BRINDLE_API const char* brindle_song_makers(const brindle_song* song);
BRINDLE_API const char* brindle_song_style(const brindle_song* song);
/* The first key that the song states; BRINDLE_ERROR_NOT_FOUND if it states none. */
BRINDLE_API brindle_status brindle_song_stated_key(const brindle_song* song, brindle_key* key);
/* Quarter notes a minute; 0 where the song does not tell. */
BRINDLE_API double brindle_song_tempo(const brindle_song* song);
BRINDLE_API double brindle_song_beats_per_bar(const brindle_song* song);
/* Without the end. */
BRINDLE_API size_t brindle_song_chord_count(const brindle_song* song);
BRINDLE_API brindle_status brindle_song_chord_at(const brindle_song* song, size_t index,
                                                 brindle_song_chord* chord);
/* As played; 0 for a text without bar lines. */
BRINDLE_API size_t brindle_song_bar_count(const brindle_song* song);
BRINDLE_API brindle_status brindle_song_bar(const brindle_song* song, size_t index,
                                            brindle_bar* bar);
BRINDLE_API size_t brindle_song_section_count(const brindle_song* song);
BRINDLE_API brindle_status brindle_song_section(const brindle_song* song, size_t index,
                                                brindle_section* section);

/* Analysis */

typedef struct brindle_analysis brindle_analysis;

/* What an analysis has beside keys, centers and the reading; to be joined by |. */
enum {
    BRINDLE_ANALYSE_ALTERNATIVES = 1, /* all readings that progressions to a tonic allow */
    BRINDLE_ANALYSE_COPIES = 2,       /* passages that repeat earlier ones */
    BRINDLE_ANALYSE_EXPLAIN = 4       /* a sentence for each chord */
};

typedef struct brindle_analysis_options {
    brindle_key stated_key; /* instead of what the song states; undefined for that */
    unsigned flags;         /* BRINDLE_ANALYSE_... */
} brindle_analysis_options;

typedef enum brindle_function {
    BRINDLE_FUNCTION_UNDEFINED = 0, /* no chord */
    BRINDLE_FUNCTION_TONIC = 1,
    BRINDLE_FUNCTION_SUBDOMINANT = 2,
    BRINDLE_FUNCTION_DOMINANT = 3,
    BRINDLE_FUNCTION_NONE = 4 /* a chord that only passes by */
} brindle_function;

/* What a chord is to the chords around it. */
typedef enum brindle_relation {
    BRINDLE_RELATION_UNDEFINED = 0,
    BRINDLE_RELATION_NONE = 1, /* a chord of the key */
    BRINDLE_RELATION_TONIC = 2,
    BRINDLE_RELATION_DOMINANT = 3,
    BRINDLE_RELATION_RELATED_SECOND = 4,
    BRINDLE_RELATION_SUBSTITUTE_DOMINANT = 5,
    BRINDLE_RELATION_LEADING_DIMINISHED = 6,
    BRINDLE_RELATION_PASSING_DIMINISHED = 7,
    BRINDLE_RELATION_COMMON_TONE_DIMINISHED = 8,
    BRINDLE_RELATION_BACKDOOR = 9,
    BRINDLE_RELATION_PLAGAL = 10,
    BRINDLE_RELATION_BORROWED = 11,
    BRINDLE_RELATION_CHROMATIC_MEDIANT = 12,
    BRINDLE_RELATION_NEAPOLITAN = 13,
    BRINDLE_RELATION_AUGMENTED_SIXTH = 14,
    BRINDLE_RELATION_BLUES = 15,
    BRINDLE_RELATION_LINE_CLICHE = 16
} brindle_relation;

/* One chord as a teacher reads it. Texts belong to the analysis; indices are those of chords, -1
 * for none. */
typedef struct brindle_chord_reading {
    double position;
    double length;
    const char* symbol;
    brindle_chord chord;
    brindle_key key;     /* of its passage; undefined for no chord */
    const char* numeral; /* in that key: "V7/ii"; "" for no chord */
    int function;        /* a brindle_function */
    int relation;        /* a brindle_relation */
    int64_t resolves_to;
    int64_t under; /* the later chord that it stands under in the tree of the song */
    int is_deceptive;
    const char* explanation; /* "" unless it was asked for */
} brindle_chord_reading;

/* A passage in one key. */
typedef struct brindle_region {
    brindle_key key;
    double position;
    double end;
    size_t first_chord;
    size_t chord_count;
} brindle_region;

/* A harmonic center that stated progressions lead to. */
typedef struct brindle_center {
    brindle_scale scale;
    double position;
    size_t chord_count;
} brindle_center;

typedef enum brindle_picture {
    BRINDLE_PICTURE_LEAD_SHEET = 0, /* bars with symbols, numerals, keys and arrows */
    BRINDLE_PICTURE_TIME_AXIS = 1   /* chords, centers and keys along a time axis */
} brindle_picture;

/* "tonic", "related second" and so on for a brindle_function and a brindle_relation; "" for what is
 * undefined. */
BRINDLE_API const char* brindle_function_name(int function);
BRINDLE_API const char* brindle_relation_name(int relation);

/* Analyses a song; `options` may be NULL for no stated key and no flags. Linear in the length of
 * the song but for alternatives and copies. */
BRINDLE_API brindle_status brindle_analyse(const brindle_song* song,
                                           const brindle_analysis_options* options,
                                           brindle_analysis** analysis);
BRINDLE_API void brindle_analysis_free(brindle_analysis* analysis);
/* BRINDLE_ERROR_NOT_FOUND for a song without chords. */
BRINDLE_API brindle_status brindle_analysis_key(const brindle_analysis* analysis, brindle_key* key);
/* The share of the key in the points of all 24, 0 to 1; -1 without a key. */
BRINDLE_API double brindle_analysis_confidence(const brindle_analysis* analysis);
BRINDLE_API size_t brindle_analysis_chord_count(const brindle_analysis* analysis);
BRINDLE_API brindle_status brindle_analysis_chord(const brindle_analysis* analysis, size_t index,
                                                  brindle_chord_reading* chord);
/* Regions follow each other without a gap. */
BRINDLE_API size_t brindle_analysis_region_count(const brindle_analysis* analysis);
BRINDLE_API brindle_status brindle_analysis_region(const brindle_analysis* analysis, size_t index,
                                                   brindle_region* region);
BRINDLE_API size_t brindle_analysis_center_count(const brindle_analysis* analysis);
BRINDLE_API brindle_status brindle_analysis_center(const brindle_analysis* analysis, size_t index,
                                                   brindle_center* center);
/* As strict JSON, the same as the program prints for a chord text. */
BRINDLE_API brindle_status brindle_analysis_json(const brindle_analysis* analysis, char** text);
/* As text for people, in lines of 80 characters. */
BRINDLE_API brindle_status brindle_analysis_text(const brindle_analysis* analysis, char** text);
/* As a picture, a file in SVG; `picture` is a brindle_picture. */
BRINDLE_API brindle_status brindle_analysis_svg(const brindle_analysis* analysis, int picture,
                                                char** text);

/* Fingerings of guitars and their like */

typedef struct brindle_grid_package brindle_grid_package;
typedef struct brindle_grids brindle_grids;

#define BRINDLE_MAX_STRINGS 16

typedef struct brindle_grid {
    const char* name;    /* told from what sounds: "Am7" */
    const char* library; /* where it comes from; "" for typed frets */
    int capo;
    size_t string_count;
    int frets[BRINDLE_MAX_STRINGS];   /* from the lowest string: -1 muted, 0 open */
    int pitches[BRINDLE_MAX_STRINGS]; /* MIDI numbers; -1 muted */
} brindle_grid;

/* Reads a package of fingerings; NULL as the path is the one that comes with the library. */
BRINDLE_API brindle_status brindle_grid_package_read(const char* path,
                                                     brindle_grid_package** package);
BRINDLE_API void brindle_grid_package_free(brindle_grid_package* package);
/* The fingerings of a chord symbol. `tuning` is written as "DADGAD" or "E2A2D3G3B3E4", NULL for the
 * standard guitar; the capo is a fret of 0 to 24. That there are none is no error. */
BRINDLE_API brindle_status brindle_grids_find(brindle_grid_package* package, const char* symbol,
                                              const char* tuning, int capo, brindle_grids** grids);
/* The chord of typed frets, "x32010" or "x-10-12-12-11-10", as one grid. */
BRINDLE_API brindle_status brindle_grids_of_frets(const char* frets, const char* tuning, int capo,
                                                  brindle_grids** grids);
BRINDLE_API void brindle_grids_free(brindle_grids* grids);
BRINDLE_API size_t brindle_grids_count(const brindle_grids* grids);
BRINDLE_API brindle_status brindle_grids_get(const brindle_grids* grids, size_t index,
                                             brindle_grid* grid);
BRINDLE_API brindle_status brindle_grids_json(const brindle_grids* grids, char** text);
BRINDLE_API brindle_status brindle_grids_svg(const brindle_grids* grids, const char* title,
                                             char** text);

/* Markov models of chord sequences */

typedef struct brindle_markov brindle_markov;

typedef struct brindle_markov_options {
    double beats;     /* length of the sequence, 1 to 10000 */
    uint64_t seed;    /* the same seed and model give the same sequence */
    size_t max_order; /* longest history; 0 for that of the model */
    size_t samples;   /* sequences to choose from, 1 to 100000 */
} brindle_markov_options;

/* 32 beats, seed 0, the order of the model, 10 samples. */
BRINDLE_API brindle_markov_options brindle_markov_options_default(void);
/* An empty model with histories of 1 to `order` chords; the order is 1 to 64. */
BRINDLE_API brindle_status brindle_markov_new(size_t order, brindle_markov** model);
BRINDLE_API void brindle_markov_free(brindle_markov* model);
/* Learns the chords of a song, cut where there is no chord. BRINDLE_ERROR_INPUT for a song with a
 * fault or without chords. */
BRINDLE_API brindle_status brindle_markov_learn(brindle_markov* model, const brindle_song* song);
/* Different symbols that the model holds: chords with their lengths, marks of begin and end.
 * Generating may add the gap that it fills. */
BRINDLE_API size_t brindle_markov_symbol_count(const brindle_markov* model);
BRINDLE_API size_t brindle_markov_order(const brindle_markov* model);
/* A model file and its text. */
BRINDLE_API brindle_status brindle_markov_read(const char* text, brindle_markov** model);
BRINDLE_API brindle_status brindle_markov_read_file(const char* path, brindle_markov** model);
BRINDLE_API brindle_status brindle_markov_write(const brindle_markov* model, char** text);
/* Replaces the file as a whole. */
BRINDLE_API brindle_status brindle_markov_write_file(const brindle_markov* model, const char* path);
/* A new sequence in the manner of what was learned, as a chord string that brindle_song_read
 * reads: "(4,C);(2,G7)". `options` may be NULL for the default. BRINDLE_ERROR_NOT_FOUND if the
 * model has no sequence of that length. */
BRINDLE_API brindle_status brindle_markov_generate(brindle_markov* model,
                                                   const brindle_markov_options* options,
                                                   char** chords);

/* Scores in MusicXML, plain or compressed */

/* The notes of a score and what stands between them, a JSON object a line. */
BRINDLE_API brindle_status brindle_score_json_lines(const void* bytes, size_t size, char** lines);
/* The notes of a score as a Standard MIDI File of `midi_size` bytes. */
BRINDLE_API brindle_status brindle_score_midi(const void* bytes, size_t size, char** midi,
                                              size_t* midi_size);

#ifdef __cplusplus
}
#endif

#endif
