-- first note -- of the  module
-- second note

library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity commented is
   port ( A : in    std_logic; 
          Y : out   std_logic);
end commented;

architecture BEHAVIORAL of commented is
   -- of the bus
   signal B : std_logic_vector (1 downto 0);
   -- of the signal
   signal N : std_logic;
   -- of the component
   component AND2
      port ( I0 : in    std_logic; 
             I1 : in    std_logic; 
             O  : out   std_logic);
   end component;
   
begin
   -- of the instance
   -- its second line, which is much longer than eighty columns and for all that stays whole
   U1 : AND2
      port map (I0=>A,
                I1=>N,
                O=>B(0));
   
   U2 : AND2
      port map (I0=>A,
                I1=>B(0),
                O=>Y);
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_commented of  commented is
   for BEHAVIORAL
      for U1, U2 : AND2
         use configuration WORK.CFG_AND2;
      end for;
   end for;
end CFG_commented;
-- synopsys translate_on

