
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity w is
   port ( A : in    std_logic);
end w;

architecture BEHAVIORAL of w is
begin
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_w of  w is
   for BEHAVIORAL
   end for;
end CFG_w;
-- synopsys translate_on

