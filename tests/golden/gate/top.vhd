
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity top is
   port ( A : in    std_logic; 
          Y : out   std_logic);
end top;

architecture BEHAVIORAL of top is
   signal MID : std_logic;
   component AND2
      port ( I0 : in    std_logic; 
             I1 : in    std_logic; 
             O  : out   std_logic);
   end component;
   
begin
   U1 : AND2
      port map (I0=>A,
                I1=>MID,
                O=>Y);
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_top of  top is
   for BEHAVIORAL
      for U1 : AND2
         use configuration WORK.CFG_AND2;
      end for;
   end for;
end CFG_top;
-- synopsys translate_on

