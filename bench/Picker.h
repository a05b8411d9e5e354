#pragma once

namespace pelmar::bench {

// Fills the card picker's model from a generated company of the given size, sorts it both ways
// and searches it to the end, printing the time of each.
int measurePicker(int cards);

}  // namespace pelmar::bench
