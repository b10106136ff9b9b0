-- In place of the library that written files name. No design here takes anything from it.
package Kelements is
end Kelements;
