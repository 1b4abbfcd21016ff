// The ids of everything that is registered, given once and for good: a host keeps them in its own
// files. The interface definitions and the library's sources both read them here.
//
// An interface that changes gets another id; nothing ever gets one that was given before.

// clang-format off: to it an id is a subtraction

// The library of the control
#define ZANDOR_LIBID_CONTROL 107ba739-e94e-47d1-ad7b-ee31825a3c31
#define ZANDOR_CLSID_CONTROL 2dc66201-8cb3-4e0d-a5b1-574a265deee7
#define ZANDOR_IID_CONTROL 23fa6021-e0c6-4d72-9818-269fd8874a68
#define ZANDOR_IID_CONTROL_EVENTS 26eefc67-d658-4c14-ac44-d1a7d9c0d86c

// Of no type library: the page of the control's properties
#define ZANDOR_CLSID_PROPERTY_PAGE 480f148a-3729-48de-ba98-f137b80ecec4

// The library of the ready-made query model
#define ZANDOR_LIBID_MODEL edbf8ba7-f577-4707-b2d6-5ea7e7ac3744
#define ZANDOR_CLSID_QUERY bd4aa8f3-01a6-49dc-a5fa-9118b5360dc2
#define ZANDOR_CLSID_JOIN 9e5b8932-8900-4041-b8cf-2ad8bd929dae
#define ZANDOR_CLSID_COLUMN_DEFINITION fe077f60-df6a-4f21-b04b-4b4f8260a704
#define ZANDOR_CLSID_TABLE_DESCRIPTION db2bdb26-8e97-42a9-a9ab-a961a9aec469
#define ZANDOR_IID_QUERY c8927c43-2ede-466b-ba08-ee92c9700082
#define ZANDOR_IID_TABLE 084adada-6bd3-41ae-b24a-d844fa38bf2f
#define ZANDOR_IID_COLUMN bfd3f2c4-e70f-4413-8398-3be64af29f74
#define ZANDOR_IID_JOIN 1150cc55-7231-4141-9a95-2b99bb554455
#define ZANDOR_IID_COLUMN_DEFINITION 05773de3-d11a-490c-9874-733e3ab4c12f
#define ZANDOR_IID_CRITERIUM f202083c-198f-48c5-ac3b-95b957b9cddf
#define ZANDOR_IID_COLLECTION 0bc051b5-3644-4ce4-8050-04f7236d73fb
#define ZANDOR_IID_TABLE_DESCRIPTION 9c39a281-1faf-4821-9852-302788df6fde
#define ZANDOR_IID_DIALECT 68ace226-b04c-4685-b83d-ea79fbb4fb94
#define ZANDOR_IID_COLUMN_TYPE 53b3860a-e582-47d7-816f-2868f64cd0e5

// Of no type library: by it the library knows its own objects
#define ZANDOR_IID_OWN 149a84e7-ffc1-47a9-98aa-6fef53f3fc01
