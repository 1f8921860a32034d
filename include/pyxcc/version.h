/**
 * @file
 * @brief The version record of the library.
 */
#ifndef PYXCC_VERSION_H
#define PYXCC_VERSION_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/** What a library says of itself. Constant data: not to be written to or freed. */
typedef struct LibVersion {
    s32 major;                 /**< first number of the version */
    s32 minor;                 /**< second number */
    s32 update;                /**< third number */
    s32 revision;              /**< number of the sources that the library is built from */
    char targetCode[4];        /**< short code of the processor variant, padded with zeros */
    const char* nameText;      /**< name of the library and of its variant */
    const char* versionText;   /**< version and revision as text */
    const char* buildDateText; /**< date of the release */
} LibVersion;

/**
 * The version record.
 *
 * @return the same pointer on every call, valid as long as the library is loaded
 */
PYXCC_API const LibVersion* PYXCC_CALL pyxccGetLibVersion(void);

#ifdef __cplusplus
}
#endif

#endif
