#ifdef QORN_WRONG_USE
int const value = 1;
#else
int const value = 2;
#endif
