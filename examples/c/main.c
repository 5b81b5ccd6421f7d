/* SPDX-License-Identifier: MIT */
/* A small host program in C: reads a song, from a file in any form or from a text, tells what each
 * chord does, names notes, makes a new sequence in the manner of the song, and writes a blues in
 * the manner of those that come with the library. */

#include "brindle/c/brindle.h"

#include <stdio.h>
#include <string.h>

static int fail(const char* what) {
    fprintf(stderr, "%s: %s (at %zu)\n", what, brindle_last_error(), brindle_last_error_position());
    return 1;
}

static brindle_song* read_song(int argc, char** argv) {
    static const char text[] = "Dm7 G7 | C Am7 | Dm7 G7 | C";
    brindle_song* song = NULL;
    const brindle_status status = argc > 1 ? brindle_song_read_file(argv[1], NULL, &song)
                                           : brindle_song_read(text, strlen(text), NULL, &song);
    if (status != BRINDLE_OK) fail("reading");
    return song;
}

static void print_faults(const brindle_song* song) {
    for (size_t i = 0; i < brindle_song_fault_count(song); ++i) {
        brindle_fault fault;
        brindle_song_fault(song, i, &fault);
        fprintf(stderr, "%zu:%zu: %s\n", fault.line, fault.column, fault.text);
    }
}

static int print_reading(const brindle_song* song) {
    brindle_analysis* analysis = NULL;
    brindle_key key;
    char* name = NULL;
    if (brindle_analyse(song, NULL, &analysis) != BRINDLE_OK) return fail("analysing");
    if (brindle_analysis_key(analysis, &key) != BRINDLE_OK) return fail("the key");
    if (brindle_key_write(&key, &name) != BRINDLE_OK) return fail("its name");
    printf("%s\n", name);
    brindle_free(name);
    for (size_t i = 0; i < brindle_analysis_chord_count(analysis); ++i) {
        brindle_chord_reading chord;
        brindle_analysis_chord(analysis, i, &chord);
        printf("%4.1f  %-4s  %-4s  %-12s %s\n", chord.position, chord.symbol, chord.numeral,
               brindle_function_name(chord.function), brindle_relation_name(chord.relation));
    }
    brindle_analysis_free(analysis);
    return 0;
}

static int print_name_of_notes(void) {
    const int notes[] = {52, 55, 57, 60};
    brindle_names* names = NULL;
    brindle_name name;
    if (brindle_names_of_notes(notes, 4, NULL, &names) != BRINDLE_OK) return fail("naming");
    brindle_names_get(names, 0, &name);
    printf("E3 G3 A3 C4 is %s\n", name.symbol);
    brindle_names_free(names);
    return 0;
}

static int print_new_sequence(const brindle_song* song) {
    brindle_markov* model = NULL;
    brindle_markov_options options = brindle_markov_options_default();
    char* chords = NULL;
    options.beats = 8.0;
    options.seed = 1;
    if (brindle_markov_new(2, &model) != BRINDLE_OK) return fail("a model");
    if (brindle_markov_learn(model, song) != BRINDLE_OK) return fail("learning");
    if (brindle_markov_generate(model, &options, &chords) != BRINDLE_OK) return fail("a sequence");
    printf("a new one: %s\n", chords);
    brindle_free(chords);
    brindle_markov_free(model);
    return 0;
}

static int print_new_song(void) {
    brindle_write_options wishes = brindle_write_options_default();
    brindle_song_model* model = NULL;
    brindle_song* song = NULL;
    char* text = NULL;
    wishes.form = "blues";
    if (brindle_key_read("F", &wishes.key) != BRINDLE_OK) return fail("a key");
    if (brindle_song_model_built_in(NULL, &model) != BRINDLE_OK) return fail("the model");
    if (brindle_song_model_write_song(model, &wishes, &song, NULL) != BRINDLE_OK) {
        brindle_song_model_free(model);
        return fail("writing");
    }
    if (brindle_song_chord_pro(song, &text) == BRINDLE_OK) printf("%s", text);
    brindle_free(text);
    brindle_song_free(song);
    brindle_song_model_free(model);
    return 0;
}

int main(int argc, char** argv) {
    brindle_song* const song = read_song(argc, argv);
    int status = song == NULL;
    if (song != NULL) {
        print_faults(song);
        status = brindle_song_has_fault(song) || print_reading(song) || print_name_of_notes() ||
                 print_new_sequence(song) || print_new_song();
    }
    brindle_song_free(song);
    return status;
}
