#include <type_traits>

#include "flat/vrl_flat.h"

// In C++ the declarations have the types that they have in C.
static_assert(__cplusplus == 201703L);
static_assert(std::is_same_v<decltype(&CSharp_ColorType_get_ColorName), char16_t* (*)(void*)>);
static_assert(std::is_same_v<decltype(&CSharp_Vrl_loadFile), int32_t (*)(void*, const char16_t*)>);
