#ifdef QORN_WRONG_USE
static_assert(sizeof(char) == 2, "as expected");
#else
static_assert(sizeof(char) == 3, "as expected");
#endif
