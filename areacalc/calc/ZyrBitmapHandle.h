// A preview image of an object. The calculation only carries it from the service that made it to
// whoever shows it, and never looks inside or frees it.
#pragma once

using ZyrBitmapHandle = void*;
