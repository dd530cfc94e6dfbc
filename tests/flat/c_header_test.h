#ifndef C_HEADER_TEST_H
#define C_HEADER_TEST_H

#ifdef __cplusplus
extern "C" {
#endif

/* What a C program finds wrong in the library's answers; null when it is content. The service must
 * hold one Pellion adapter with ID 3, type name "C" and status 2, and then one event with number 9.
 */
const char* faultThatCFinds(void);

#ifdef __cplusplus
}
#endif

#endif
