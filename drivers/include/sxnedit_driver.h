/*
 * The interface between SXNedit and its instrument drivers, version 2.
 *
 * A driver is a shared library that exports the functions below with C linkage. It turns
 * what an instrument recorded or sends into neutral records, one text line at a time; it
 * never reads files or ports itself. The program hands it bytes (from a raw file, or from
 * the serial port during a download) and takes back records through the host's callbacks.
 * Everything the instrument sent is kept by the program in the raw file, whatever the
 * driver makes of it.
 *
 * Version 2 adds the upload: points of a job written in the instrument's format. Its two
 * functions are optional; a driver that cannot write points leaves them out.
 *
 * The program refuses a driver whose sxn_driver_api_version() lies outside
 * SXN_DRIVER_API_OLDEST to SXN_DRIVER_API_VERSION, or that lacks any function of version 1.
 * A driver of version 1 still loads and reads; the program never asks it for an upload.
 *
 * Threads: the program calls a session from one thread at a time. Calls never throw.
 */
#ifndef SXNEDIT_DRIVER_H
#define SXNEDIT_DRIVER_H

#include <stddef.h>

#ifdef __cplusplus
extern "C" {
#endif

#define SXN_DRIVER_API_VERSION 2u
/* The oldest interface version the program still loads. */
#define SXN_DRIVER_API_OLDEST 1u

#define SXN_DRIVER_EXPORT __attribute__((visibility("default")))

/* Import mode (also the upload's): bits 0 to 2 the angular unit of the records, bits 3 to 5 the
 * linear unit. Any other value of a group counts as its first unit. */
#define SXN_MODE_DMS 1u     /* ddd.mmss */
#define SXN_MODE_DEGREES 2u /* decimal degrees */
#define SXN_MODE_GONS 4u
#define SXN_MODE_METRES 8u
#define SXN_MODE_FEET 16u
#define SXN_MODE_US_FEET 32u

/* Download flags. */
#define SXN_DOWNLOAD_ACKNAK 1u /* acknowledge every block read (ACK) or refused (NAK) */

/* Results of sxn_driver_translate. */
#define SXN_MORE 0 /* give more bytes when they come */
#define SXN_END 1  /* the data said that the transfer is over; give no more bytes */

/* Characters of one record, without a terminator. */
#define SXN_RECORD_MAX 255

typedef struct sxn_session sxn_session;

typedef struct sxn_host {
    void* context;
    /* One neutral record: UTF-8, NUL-terminated, no line end, at most SXN_RECORD_MAX
     * characters. The text is copied before the call returns. */
    void (*record)(void* context, const char* text);
    /* A message for the user about the data: a file of another format, blocks that could
     * not be read. UTF-8, one sentence or two. */
    void (*message)(void* context, const char* text);
    /* Bytes to the instrument; null for a file. Gives how many were taken, or -1. */
    long (*send)(void* context, const unsigned char* bytes, size_t size);
} sxn_host;

/* SXN_DRIVER_API_VERSION as the driver was built. */
SXN_DRIVER_EXPORT unsigned sxn_driver_api_version(void);
/* The instrument's name as lists show it, unique among the drivers. */
SXN_DRIVER_EXPORT const char* sxn_driver_name(void);
/* One line that describes the driver. */
SXN_DRIVER_EXPORT const char* sxn_driver_description(void);
/* The raw file extensions, comma-separated, without dots; may be empty. */
SXN_DRIVER_EXPORT const char* sxn_driver_extensions(void);

/* A session that translates a raw file, records in the units of `mode`. The host is
 * copied. Null on failure. */
SXN_DRIVER_EXPORT sxn_session* sxn_driver_import(const sxn_host* host, unsigned mode);
/* A session that receives from an instrument; may send to it at once. */
SXN_DRIVER_EXPORT sxn_session* sxn_driver_download(const sxn_host* host, unsigned mode,
                                                   unsigned flags);
/* The next bytes of the source; records that they complete go to the host. */
SXN_DRIVER_EXPORT int sxn_driver_translate(sxn_session* session, const unsigned char* bytes,
                                           size_t size);
/* 1 when the link counts as dead: asked after `period_ms` without a new record, with the
 * time since the last byte came. */
SXN_DRIVER_EXPORT int sxn_driver_time_out(sxn_session* session, unsigned idle_ms,
                                          unsigned period_ms);
/* The source has ended: records still held back go to the host, then the session is freed. */
SXN_DRIVER_EXPORT void sxn_driver_finish(sxn_session* session);
/* Stops the session at once, without further records, and frees it. */
SXN_DRIVER_EXPORT void sxn_driver_abort(sxn_session* session);

/* Version 2, optional: the upload. A session that writes points for the instrument; their
 * bytes go out through the host's send, to the serial port or to a file that the program
 * writes. Coordinates come in the linear unit of `mode`. Null on failure. The session ends
 * with sxn_driver_finish (which sends what closes the data) or sxn_driver_abort. */
SXN_DRIVER_EXPORT sxn_session* sxn_driver_upload(const sxn_host* host, unsigned mode);
/* One point of an upload: name and code UTF-8 (the code may be empty), `has_height` 0 for a
 * point without height. Gives 1 when it was sent; 0 when the format cannot hold the point (a
 * message has said why) and the upload goes on without it; -1 when the host's send failed,
 * and the session should be aborted. */
SXN_DRIVER_EXPORT int sxn_driver_upload_point(sxn_session* session, const char* name,
                                              const char* code, double east, double north,
                                              double height, int has_height);

#ifdef __cplusplus
}
#endif

#endif /* SXNEDIT_DRIVER_H */
