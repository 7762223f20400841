/**
 * @file config_store.h
 * @brief A configuration tree for hosts that have none of their own, read from a TOML file.
 *
 * Linking this library supplies the eight `config_*` operations that libedid_composer binds to (see edid_composer.h).
 * The tree is made from a TOML 1.0 document:
 *
 * - tables and arrays are nodes with children: those of a table in the order of the file, those of an array in the
 *   order of the array, each named by its index from "0" on;
 * - integers and strings are values, and booleans are read as 0 and 1. Integers range from -2147483648 to 4294967295;
 *   those above 2147483647 keep their bit pattern, so that the unsigned reader returns what was written;
 * - anything else (floats, dates and times), as well as a key that no path can name (empty, or with a dot or a control
 *   character), a path of more than 255 characters, a NUL in a string, a character that is not ASCII outside of strings
 *   and comments, nesting deeper than 64, an array of more than 1000 elements, and a document of more than 1 MiB, is
 *   refused.
 *
 * A process has one tree, which is empty until a first load succeeds. A load that fails leaves the tree as it was.
 *
 * Threads: any number of threads may read at once. Loading must not run at the same time as anything else in here, and
 * makes every node handle invalid.
 *
 * The header is self-contained and valid as C11 and as C++17.
 */
#ifndef EDID_CONFIG_STORE_H
#define EDID_CONFIG_STORE_H

#include <stdbool.h>
#include <stddef.h>
#include <stdint.h>

/** Marks what the shared library exports. */
#define EDID_CONFIG_STORE_API __attribute__((visibility("default")))

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Loads the tree from a file.
 *
 * @param path the file, NUL-terminated.
 * @return false when the file cannot be read or is refused: see @ref config_store_error.
 */
EDID_CONFIG_STORE_API bool config_store_load_file(const char *path);

/**
 * Loads the tree from a text in memory.
 *
 * @param text the TOML document; only read.
 * @param length its length in bytes.
 * @param name what errors call the document, NUL-terminated; usually the name of the file that it came from.
 * @return false when the document is refused: see @ref config_store_error.
 */
EDID_CONFIG_STORE_API bool config_store_load_text(const char *text, size_t length, const char *name);

/** Loads the default platform, which is part of this library. */
EDID_CONFIG_STORE_API bool config_store_load_default(void);

/**
 * The TOML document of the default platform, with comments: a starting point for your own.
 *
 * Never NULL, NUL-terminated, read-only, valid as long as the library is loaded.
 */
EDID_CONFIG_STORE_API const char *config_store_default_text(void);

/** The same with the table `hdmi2`, in which everything is as the sink has it, up to 600 MHz. */
EDID_CONFIG_STORE_API const char *config_store_hdmi2_text(void);

/**
 * What was wrong with the last load, as one line without a newline: `file:line:column: key: what is wrong`, without
 * the parts that do not apply. Empty when the last load succeeded.
 *
 * Never NULL, NUL-terminated, valid until the next load.
 */
EDID_CONFIG_STORE_API const char *config_store_error(void);

/**
 * The place of a node in the document that was loaded: of its key, or of the value of an array's element. For programs
 * that report on a configuration.
 *
 * @param node a handle from a `config_node_*` operation.
 * @param line receives the line, counted from 1. May be NULL.
 * @param column receives the column, counted from 1. May be NULL.
 * @return false, with both untouched, for the root and for a handle of no node.
 */
EDID_CONFIG_STORE_API bool config_store_node_position(uint32_t node, unsigned *line, unsigned *column);

#ifdef __cplusplus
}
#endif

#endif /* EDID_CONFIG_STORE_H */
