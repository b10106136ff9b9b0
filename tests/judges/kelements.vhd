-- What the default clauses of a written file take from the vendor's library.
package Kelements is
    type speed_t is (SLOW, FAST);
    attribute IOSTD : string;
end Kelements;
