
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity generics is
   generic( WIDTH : integer :=  8
   -- synopsys translate_off
   ;
            EDGE : bit :=  '1'
   -- synopsys translate_on
   );
   port ( I : in    std_logic; 
          O : out   std_logic_vector (4 downto 0));
end generics;

architecture BEHAVIORAL of generics is
   component MEM
      generic( DEPTH : integer :=  16;
               TITLE : string :=  "mem a";
               MASK : bit_vector :=  x"A5";
               MODE : speed_t :=  FAST
      -- synopsys translate_off
      ;
               DELAY : real :=  1.50;
               CHECK : boolean :=  TRUE
      -- synopsys translate_on
      );
      port ( A : in    std_logic; 
             O : out   std_logic);
   end component;
   
   component DLY
      -- synopsys translate_off
      generic( T : real :=  0.5);
      -- synopsys translate_on
      port ( A : in    std_logic; 
             O : out   std_logic);
   end component;
   
begin
   U1 : MEM
   generic map( DEPTH => 32
   -- synopsys translate_off
   ,
            DELAY => 2.25
   -- synopsys translate_on
   )
      port map (A=>I,
                O=>O(0));
   
   U2 : MEM
   -- synopsys translate_off
   generic map( DELAY => 12.0)
   -- synopsys translate_on
      port map (A=>I,
                O=>O(1));
   
   U3 : MEM
   generic map( DEPTH => 4,
            MASK => b"00001111")
      port map (A=>I,
                O=>O(2));
   
   U4 : MEM
      port map (A=>I,
                O=>O(3));
   
   U5 : DLY
      port map (A=>I,
                O=>O(4));
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_generics of  generics is
   for BEHAVIORAL
      for U5 : DLY
         use configuration WORK.CFG_DLY;
      end for;
      for U1, U2, U3, U4 : MEM
         use configuration WORK.CFG_MEM;
      end for;
   end for;
end CFG_generics;
-- synopsys translate_on

