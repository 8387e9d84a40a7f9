#ifdef QORN_WRONG_USE
static_assert(sizeof(char) == 2, "as expected");
#endif
