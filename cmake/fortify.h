/* Compiled before everything else: calls of the C library that can overflow a buffer are checked, where there is an
 * optimiser, which the checks need, and where the user's flags don't choose a level themselves. */
#if defined(__OPTIMIZE__) && !defined(_FORTIFY_SOURCE)
#define _FORTIFY_SOURCE 2
#endif
