#include "platform/support/KvCSrcRef.h"

KvCSrcRef::~KvCSrcRef() = default;

WmCXString KvCSrcRef::getText() const { return origin; }
